#include "shell/setup_dlg.h"

#include "platform/dialog/combo_box.h"
#include "platform/window/application.h"
#include "shell/res/dialog_templates.h"

namespace feltside {

using platform::CComboBox;

CSetupDlg::CSetupDlg() : CDialog(SetupTemplate()) {}

bool CSetupDlg::OnInitDialog() {
  CDialog::OnInitDialog();
  Item<CComboBox>(kSetupSpeed).SetCurSel(m_nSpeed);
  Item<CComboBox>(kSetupGameType).SetCurSel(m_nGameType);
  Item<CComboBox>(kSetupStrategy).SetCurSel(m_nStrategy);
  Item<CComboBox>(kSetupDecks).SetCurSel(m_nDecks);
  return true;
}

void CSetupDlg::OnOK() {
  m_nGameType = Item<CComboBox>(kSetupGameType).GetValue();
  m_nSpeed = Item<CComboBox>(kSetupSpeed).GetValue();
  m_nStrategy = Item<CComboBox>(kSetupStrategy).GetValue();
  m_nDecks = Item<CComboBox>(kSetupDecks).GetValue();
  CDialog::OnOK();
}

void CSetupDlg::OnHelp() { platform::TheApp().ShowHelp("file:cardroom.htm#game_setup"); }

}  // namespace feltside
