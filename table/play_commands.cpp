// The view's commands: which may run when, and what the adviser says of a move.

#include <array>

#include "engine/advice.h"
#include "table/command_ids.h"
#include "table/feltside_view.h"

namespace feltside {

struct CFeltsideView::Commands {
  using View = CFeltsideView;
  static constexpr std::array<platform::CommandEntry<View>, 9> kMap = {{
      {kCommandHit, &View::OnHit, &View::CanHit},
      {kCommandDoubleDown, &View::OnDoubleDown, &View::CanDoubleDown},
      {kCommandSplit, &View::OnSplit, &View::CanSplit},
      {kCommandStand, &View::OnStand, &View::CanStand},
      {kCommandDeal, &View::OnDeal, &View::CanDeal},
      {kCommandTableSetup, &View::OnTableSetup},
      {platform::kCommandExit, &View::OnExit},
      {kCommandHighScores, &View::OnHighScores, &View::CanShowHighScores},
      {kCommandGameSetup, &View::OnGameSetup, &View::CanDeal},
  }};
};

platform::CommandState CFeltsideView::QueryCommand(int commandID) const {
  return QueryCommandMap(*this, Commands::kMap, commandID);
}

void CFeltsideView::RunCommand(int commandID) { RunCommandMap(*this, Commands::kMap, commandID); }

bool CFeltsideView::CanDeal() const { return m_bHandInProgress == 0; }

bool CFeltsideView::CanStand() const {
  return m_nGameType == kGameBlackjack && m_bHandInProgress != 0 && m_bInsuranceOffered == 0;
}

bool CFeltsideView::CanHit() const {
  return CanStand() && ActiveHand().GetCount() < ActiveHand().GetLimit();
}

bool CFeltsideView::CanDoubleDown() const { return CanStand() && ActiveHand().GetCount() <= 2; }

bool CFeltsideView::CanSplit() const {
  return CanStand() && !IsSplit() && m_handPlayer.IsPair() != 0;
}

void CFeltsideView::OnHit() {
  JudgeMove(ADVICE_HIT);
  Hit();
}

void CFeltsideView::OnStand() {
  JudgeMove(ADVICE_STAND);
  Stand();
}

void CFeltsideView::OnDoubleDown() {
  JudgeMove(ADVICE_DOUBLE);
  DoubleDown();
}

void CFeltsideView::OnSplit() {
  JudgeMove(ADVICE_SPLIT);
  Split();
}

void CFeltsideView::JudgeMove(int adviceCode) {
  if (m_nStrategyMode != kStrategyButton) return;
  m_bShowVerdict = 1;
  std::string text;
  m_bVerdictCorrect = GetAdvice(ActiveHand(), text, UpCard()) == adviceCode ? 1 : 0;
}

}  // namespace feltside
