// One blackjack frame, from the state of the table.

#include "engine/advice.h"
#include "table/feltside_view.h"

namespace feltside {

void CFeltsideView::DrawBlackjackTable() {
  if (m_bInsuranceOffered != 0) m_layout.DrawInsuranceButtons();
  DrawPlayerSide();
  DrawDealerSide();
  m_layout.DrawPlayerBox(m_nBet, m_dWallet, m_bHandInProgress != 0);
  DrawStrategy();
}

void CFeltsideView::DrawPlayerSide() {
  if (!IsSplit()) {
    m_layout.DrawHand(POS_BOTTOM, m_handPlayer);
    m_layout.DrawLabel(POS_BOTTOM, "You");
    m_layout.DrawHandText(POS_BOTTOM, m_strPlayerScore, true);
    m_layout.DrawHandText(POS_ABOVE_BOTTOM, m_strPlayerMsg, false);
    return;
  }
  m_layout.DrawHand(POS_BOTTOM_LEFT, m_handPlayer);
  m_layout.DrawHand(POS_BOTTOM_RIGHT, m_handSplit);
  m_layout.DrawHandText(POS_ABOVE_BOTTOM_LEFT, m_strPlayerMsg, false);
  m_layout.DrawHandText(POS_ABOVE_BOTTOM_RIGHT, m_strSplitMsg, false);
  m_layout.DrawHandText(POS_BOTTOM_LEFT, m_strPlayerScore, true);
  m_layout.DrawHandText(POS_BOTTOM_RIGHT, m_strSplitScore, true);
  if (m_bHandInProgress != 0) {
    m_layout.DrawActiveMarker(m_bPlayingSplit != 0 ? POS_BOTTOM_RIGHT : POS_BOTTOM_LEFT);
  }
}

void CFeltsideView::DrawDealerSide() {
  if (m_bHandInProgress != 0) {
    m_layout.DrawCardBack(POS_TOP, 0);
    m_layout.DrawCard(POS_TOP, 1, UpCard());
  } else {
    m_layout.DrawHand(POS_TOP, m_handDealer);
  }
  m_layout.DrawLabel(POS_TOP, "Dealer");
  m_layout.DrawHandText(POS_TOP, m_strDealerScore, true);
}

void CFeltsideView::DrawStrategy() {
  if (m_nStrategyMode == kStrategyNone) return;
  const bool onRequest = m_nStrategyMode == kStrategyButton;
  if (onRequest && m_bShowVerdict != 0) m_layout.DrawVerdictLamp(m_bVerdictCorrect != 0);
  if (m_bHandInProgress == 0) return;
  if (IsAdviceShown()) {
    m_layout.DrawAdvice(AdviceText());
  } else {
    m_layout.DrawStrategyButton();
  }
}

bool CFeltsideView::IsAdviceShown() const {
  return m_nStrategyMode != kStrategyNone &&
         (m_nStrategyMode != kStrategyButton || m_bShowAdvice != 0);
}

std::string CFeltsideView::AdviceText() const {
  if (m_bInsuranceOffered != 0) return "No Insurance";
  std::string text;
  GetAdvice(ActiveHand(), text, UpCard());
  return text;
}

}  // namespace feltside
