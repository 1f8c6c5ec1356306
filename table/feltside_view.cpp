#include "table/feltside_view.h"

#include <cmath>
#include <limits>

#include "platform/window/application.h"

namespace feltside {

CFeltsideView::CFeltsideView(platform::CFrameWindow& frame)
    : CView(&frame, frame.ViewPlace()), m_layout(platform::TheApp().Resources()) {}

void CFeltsideView::OnInitialUpdate() {
  CView::OnInitialUpdate();
  LoadSettings();
  m_deck1.Shuffle();
  m_shoe4.Shuffle();
  m_shoe6.Shuffle();
  m_handPoker.SetLimit(kPokerCards);
  m_layout.m_nRowCards = kPokerCards;
  if (m_bHandInProgress != 0) TakeOutHands();
}

void CFeltsideView::OnDeal() {
  m_bShowTitle = 0;
  m_pTitleBitmap.reset();
  platform::TheApp().TellAnew();  // a deal may look like the last one
  if (m_nGameType == kGameBlackjack) {
    DealBlackjack();
  } else if (m_nGameType == kGameVideoPoker) {
    DealVideoPoker();
  } else {
    Repaint();
  }
}

void CFeltsideView::Repaint() {
  Invalidate();
  UpdateWindow();
}

int WholeDollars(double dollars) {
  constexpr double kLowest = std::numeric_limits<int>::min();
  constexpr double kHighest = std::numeric_limits<int>::max();
  if (dollars <= kLowest) return std::numeric_limits<int>::min();
  if (dollars >= kHighest) return std::numeric_limits<int>::max();
  return static_cast<int>(std::trunc(dollars));
}

}  // namespace feltside
