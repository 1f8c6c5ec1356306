// The shoes, and how the games take cards from them.

#include "table/feltside_view.h"

namespace feltside {

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

void CFeltsideView::PrepareShoe() {
  CShoe* shoe = SelectedShoe();
  if (shoe != nullptr && !shoe->IsNearEnd()) shoe->Shuffle();
}

int CFeltsideView::NextCard() {
  CShoe* shoe = SelectedShoe();
  return shoe == nullptr ? kNoCard : DrawFrom(*shoe, {&m_handPlayer, &m_handSplit, &m_handDealer});
}

int CFeltsideView::DrawFrom(CShoe& shoe, std::initializer_list<const CCardHand*> out) {
  const int card = shoe.TakeCard();
  if (card != kNoCard) return card;
  shoe.Shuffle();
  for (const CCardHand* hand : out) shoe.TakeOut(*hand);
  return shoe.TakeCard();
}

void CFeltsideView::TakeOutHands() {
  if (m_nGameType == kGameVideoPoker) {
    m_deck1.TakeOut(m_handPoker);
  } else if (CShoe* shoe = SelectedShoe(); shoe != nullptr) {
    for (const CCardHand* hand : {&m_handPlayer, &m_handSplit, &m_handDealer}) {
      shoe->TakeOut(*hand);
    }
  }
}

}  // namespace feltside
