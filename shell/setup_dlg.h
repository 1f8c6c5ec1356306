#pragma once

#include "platform/dialog/dialog.h"

namespace feltside {

/// What is played, how fast, with how many decks, and how much the adviser says. Set the members,
/// run it, and read them after OK; each is a place in its list, -1 for no choice.
class CSetupDlg : public platform::CDialog {
 public:
  CSetupDlg();

  bool OnInitDialog() override;
  void OnOK() override;
  bool HasHelp() const override { return true; }
  void OnHelp() override;

  int m_nGameType = 0;
  int m_nSpeed = 0;
  int m_nStrategy = 0;
  int m_nDecks = 0;
};

}  // namespace feltside
