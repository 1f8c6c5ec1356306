// The setup commands: they show the table's settings in a dialog and, when it is confirmed, take
// them over, keep them and repaint.

#include "platform/window/application.h"
#include "shell/settings.h"
#include "shell/setup_dlg.h"
#include "shell/setup_table_dlg.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr int kManyDiscards = 5;
constexpr int kFewDiscards = 3;

void WriteSetting(const char* entry, int value) {
  platform::TheApp().Profile().WriteInt(kSettingsSection, entry, value);
}

}  // namespace

void CFeltsideView::OnGameSetup() {
  CSetupDlg dialog;
  dialog.m_nGameType = m_nGameType;
  dialog.m_nStrategy = m_nStrategyMode;
  dialog.m_nDecks = m_nDeckChoice;
  dialog.m_nSpeed = PlaySpeed();
  if (dialog.DoModal() != platform::kResultOk) return;
  m_nGameType = dialog.m_nGameType;
  m_nStrategyMode = dialog.m_nStrategy;
  m_nDeckChoice = dialog.m_nDecks;
  WriteSetting("STRATTYPE", m_nStrategyMode);
  WriteSetting("GAME_TYPE", m_nGameType);
  WriteSetting("NUMDECKS", m_nDeckChoice);
  SetPlaySpeed(dialog.m_nSpeed);
  WriteSetting("PLAYSPEED", dialog.m_nSpeed);
  OnDeal();
}

void CFeltsideView::OnTableSetup() {
  CSetupTableDlg dialog;
  dialog.m_nCardBackID = m_layout.m_nCardBackID;
  dialog.m_crTable = m_layout.m_crTable;
  dialog.m_crBox = m_layout.m_crBox;
  dialog.m_bFancyPoker = m_bFancyPoker;
  dialog.m_bFancyBlackjack = m_bFancyBlackjack;
  dialog.m_bUseHighScores = m_bUseHighScores;
  dialog.m_bFiveDiscards = m_nMaxDiscards == kManyDiscards ? 1 : 0;
  if (dialog.DoModal() != platform::kResultOk) return;
  m_layout.m_crBox = dialog.m_crBox;
  m_layout.m_crTable = dialog.m_crTable;
  m_layout.m_nCardBackID = dialog.m_nCardBackID;
  m_bFancyPoker = dialog.m_bFancyPoker;
  m_bFancyBlackjack = dialog.m_bFancyBlackjack;
  m_bUseHighScores = dialog.m_bUseHighScores;
  m_nMaxDiscards = dialog.m_bFiveDiscards != 0 ? kManyDiscards : kFewDiscards;
  WriteSetting("TABLECOLOR", static_cast<int>(m_layout.m_crTable));
  WriteSetting("BOXCOLOR", static_cast<int>(m_layout.m_crBox));
  WriteSetting("CARDBACK", m_layout.m_nCardBackID);
  WriteSetting("VIDEODISCARDS", m_nMaxDiscards);
  WriteSetting("FANCYVP", m_bFancyPoker);
  WriteSetting("FANCYBJ", m_bFancyBlackjack);
  WriteSetting("USEHIGH", m_bUseHighScores);
  if (m_bFancyPoker == 0) m_pPokerBitmap.reset();
  Repaint();
}

}  // namespace feltside
