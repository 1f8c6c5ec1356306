// The setup commands: they show the table's settings in a dialog and, when it is confirmed, take
// them over, keep them and repaint.

#include "shell/settings.h"
#include "shell/setup_dlg.h"
#include "shell/setup_table_dlg.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr int kManyDiscards = 5;
constexpr int kFewDiscards = 3;

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
  SetPlaySpeed(dialog.m_nSpeed);
  StoreSettings({kStrategyMode, kGameType, kDeckChoice, kPlaySpeed});
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
  StoreSettings({kTableColor, kBoxColor, kCardBack, kMaxDiscards, kFancyPoker, kFancyBlackjack,
                 kUseHighScores});
  if (m_bFancyPoker == 0) m_pPokerBitmap.reset();
  Repaint();
}

}  // namespace feltside
