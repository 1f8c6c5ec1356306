#include "shell/setup_table_dlg.h"

#include "platform/dialog/combo_box.h"
#include "platform/window/application.h"
#include "shell/edit_color_dlg.h"
#include "shell/res/dialog_templates.h"

namespace feltside {
namespace {

/// Where the chosen card back is shown, in client pixels: in the empty band below the list.
constexpr platform::Point kPreviewAt{30, 70};
constexpr platform::Size kPreviewSize{29, 41};

}  // namespace

CSetupTableDlg::CSetupTableDlg() : CDialog(SetupTableTemplate()) {}

bool CSetupTableDlg::OnInitDialog() {
  CDialog::OnInitDialog();
  auto& backs = Item<platform::CComboBox>(kTableCardBack);
  backs.SetCurSel(m_nCardBackID - kFirstCardBackID);
  m_nCardBackID = backs.GetValue() + kFirstCardBackID;
  return true;
}

void CSetupTableDlg::DoDataExchange(Exchange direction) {
  ExchangeCheck(direction, kTableFancyPoker, m_bFancyPoker);
  ExchangeCheck(direction, kTableFancyBlackjack, m_bFancyBlackjack);
  ExchangeCheck(direction, kTableUseHighScores, m_bUseHighScores);
  ExchangeCheck(direction, kTableFiveDiscards, m_bFiveDiscards);
}

void CSetupTableDlg::OnButton(int controlID) {
  if (controlID == kTableColorButton) EditColor(m_crTable);
  if (controlID == kTableBoxButton) EditColor(m_crBox);
}

void CSetupTableDlg::EditColor(platform::Color& color) {
  CEditColorDlg dialog;
  dialog.m_crColor = color;
  if (dialog.DoModal() == platform::kResultOk) color = dialog.m_crColor;
  Invalidate();
}

void CSetupTableDlg::OnSelChange(int controlID) {
  m_nCardBackID = Item<platform::CComboBox>(controlID).GetValue() + kFirstCardBackID;
  Invalidate();
}

std::optional<platform::Color> CSetupTableDlg::OnCtlColor(int controlID) const {
  if (controlID == kTableColorSwatch) return m_crTable;
  if (controlID == kTableBoxSwatch) return m_crBox;
  return std::nullopt;
}

void CSetupTableDlg::OnPaintClient(platform::CSurface& surface) {
  const auto& back = platform::TheApp().Resources().LoadBitmap(m_nCardBackID, kPreviewSize);
  surface.BitBlt(kPreviewAt, kPreviewSize, back);
}

void CSetupTableDlg::OnHelp() { platform::TheApp().ShowHelp("file:cardroom.htm#table_setup"); }

}  // namespace feltside
