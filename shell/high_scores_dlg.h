#pragma once

#include "platform/dialog/dialog.h"

namespace feltside {

/// The list of the five best results. In entry mode it also takes a name for a new one.
class CHighScoresDlg : public platform::CDialog {
 public:
  CHighScoresDlg();

  bool OnInitDialog() override;
  void OnOK() override;
  void OnButton(int controlID) override;

  int m_bNewHighScore = 0;  ///< 1: entry mode
  int m_nScore = 0;         ///< the result to be entered

 private:
  /// Enters the name that was typed; an empty one sends the keyboard back to it.
  void OnAdd();
  void RefreshList();
  void ShowEntry(bool visible);
  bool IsEntryOpen() const;
};

}  // namespace feltside
