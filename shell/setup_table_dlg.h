#pragma once

#include "platform/dialog/dialog.h"
#include "render/picture_ids.h"

namespace feltside {

/// How the table looks and a few rules of the house. Set the members, run it, and read them after
/// OK.
class CSetupTableDlg : public platform::CDialog {
 public:
  CSetupTableDlg();

  bool OnInitDialog() override;
  void OnButton(int controlID) override;
  void OnSelChange(int controlID) override;
  std::optional<platform::Color> OnCtlColor(int controlID) const override;
  void OnPaintClient(platform::CSurface& surface) override;
  bool HasHelp() const override { return true; }
  void OnHelp() override;

  int m_bFancyPoker = 1;
  int m_bFancyBlackjack = 1;
  int m_bUseHighScores = 1;
  int m_bFiveDiscards = 0;
  platform::Color m_crTable = platform::kWhite;
  platform::Color m_crBox = platform::kWhite;
  int m_nCardBackID = kFirstCardBackID;  ///< 54..65

 protected:
  void DoDataExchange(Exchange direction) override;

 private:
  void EditColor(platform::Color& color);
};

}  // namespace feltside
