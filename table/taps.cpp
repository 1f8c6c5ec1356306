// Taps on the table.

#include "table/feltside_view.h"

namespace feltside {

using platform::Point;

void CFeltsideView::OnLButtonDown(Point p) {
  if (m_nGameType == kGameVideoPoker) {
    TapVideoPoker(p);
  } else {
    TapBlackjack(p);
  }
}

void CFeltsideView::TapBlackjack(Point p) {
  if (IsStrategyButtonLive() && m_layout.HitStrategyButton(p) != 0) {
    m_bShowAdvice = 1;
    Repaint();
  }
  if (m_bInsuranceOffered == 0 && m_bHandInProgress != 0) return;
  // The stake can be changed before any frame has placed the table.
  platform::CBitmap nothing;
  platform::CSurface surface(nothing);
  m_layout.Prepare(surface, GetClientRect());
  if (m_bInsuranceOffered != 0) {
    TapInsurance(p);
  } else {
    TapStake(p);
  }
  m_layout.Release();
}

bool CFeltsideView::IsStrategyButtonLive() const {
  return m_bShowTitle == 0 && m_nStrategyMode == kStrategyButton && m_bShowAdvice == 0;
}

void CFeltsideView::TapInsurance(Point p) {
  if (m_layout.HitInsuranceYes(p) != 0) {
    AnswerInsurance(1);
  } else if (m_layout.HitInsuranceNo(p) != 0) {
    AnswerInsurance(0);
  }
}

void CFeltsideView::TapStake(Point p) {
  if (m_layout.HitBetDown(p) != 0) LowerBet();
  if (m_layout.HitBetUp(p) != 0) RaiseBet();
  Repaint();
}

void CFeltsideView::TapVideoPoker(Point p) {
  if (IsOnDealButton(p)) {
    if (m_bHandInProgress != 0) {
      DrawVideoPoker();
    } else {
      OnDeal();
    }
    return;
  }
  if (m_bDrawPending == 0) return;
  if (const int slot = m_layout.HitTestCard(p); slot >= 0) ToggleDiscard(slot);
}

bool CFeltsideView::IsOnDealButton(Point p) const {
  if (m_bFancyPoker != 0) return CTableLayout::kFancyDealButton.Contains(p);
  return m_bShowTitle == 0 && m_layout.HitDealButton(p) != 0;
}

}  // namespace feltside
