#include "table/feltside_view.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace feltside {
namespace {

/// A shoe is shuffled anew before a deal unless so few cards remain.
constexpr int kShoeReserve = 15;

}  // namespace

CFeltsideView::CFeltsideView(platform::CFrameWindow& frame)
    : CView(&frame, platform::CFrameWindow::ViewPlace()) {}

void CFeltsideView::OnInitialUpdate() {
  CView::OnInitialUpdate();
  LoadSettings();
  m_deck1.Shuffle();
  m_shoe4.Shuffle();
  m_shoe6.Shuffle();
  m_handPoker.SetLimit(kPokerCards);
  m_layout.m_nRowCards = kPokerCards;
}

void CFeltsideView::OnDeal() {
  m_bShowTitle = 0;
  m_pTitleBitmap.reset();
  if (m_nGameType == kGameBlackjack) {
    DealBlackjack();
  } else if (m_nGameType == kGameVideoPoker) {
    DealVideoPoker();
  }
  Repaint();
}

CShoe* CFeltsideView::SelectedShoe() {
  switch (m_nDeckChoice) {
    case 0:
      return &m_deck1;
    case 1:
      return &m_shoe4;
    case 2:
      return &m_shoe6;
    default:
      return nullptr;
  }
}

int CFeltsideView::NextCard() {
  CShoe* shoe = SelectedShoe();
  return shoe == nullptr ? kNoCard : DrawFrom(*shoe, {&m_handPlayer, &m_handSplit, &m_handDealer});
}

int CFeltsideView::DrawFrom(CShoe& shoe, std::initializer_list<const CCardHand*> out) {
  int card = shoe.TakeCard();
  if (card != kNoCard) return card;
  shoe.Shuffle();
  const auto holds = [&card](const CCardHand* hand) { return hand->Contains(card); };
  do {
    card = shoe.TakeCard();
  } while (std::any_of(out.begin(), out.end(), holds));
  return card;
}

void CFeltsideView::PrepareShoe() {
  CShoe* shoe = SelectedShoe();
  if (shoe != nullptr && shoe->GetPosition() < shoe->GetCount() - kShoeReserve) shoe->Shuffle();
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
