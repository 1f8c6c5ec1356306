#include "table/feltside_view.h"

#include <cmath>
#include <limits>

namespace feltside {
CFeltsideView::CFeltsideView(platform::CFrameWindow& frame) : CView(&frame, frame.ViewPlace()) {}

void CFeltsideView::OnInitialUpdate() {
  CView::OnInitialUpdate();
  LoadSettings();
  m_deck1.Shuffle();
  m_shoe4.Shuffle();
  m_shoe6.Shuffle();
  m_handPoker.SetLimit(kPokerCards);
  m_layout.m_nRowCards = kPokerCards;
  if (m_bHandInProgress != 0) SetHandsAside();
}

/// The document was renewed while a hand is played: its cards are not in the shuffled shoe.
void CFeltsideView::SetHandsAside() {
  if (m_nGameType == kGameVideoPoker) {
    m_deck1.SetAside(m_handPoker);
  } else if (CShoe* shoe = SelectedShoe(); shoe != nullptr) {
    for (const CCardHand* hand : {&m_handPlayer, &m_handSplit, &m_handDealer}) {
      shoe->SetAside(*hand);
    }
  }
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
  const int card = shoe.TakeCard();
  if (card != kNoCard) return card;
  shoe.Shuffle();
  for (const CCardHand* hand : out) shoe.SetAside(*hand);
  return shoe.TakeCard();
}

void CFeltsideView::PrepareShoe() {
  CShoe* shoe = SelectedShoe();
  if (shoe != nullptr && !shoe->IsNearEnd()) shoe->Shuffle();
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
