#include "engine/shoe.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>

#include "platform/dialog/message_box.h"

namespace feltside {

unsigned ShuffleSeed(unsigned nShuffles, const platform::LocalTime& time) {
  unsigned seed = nShuffles;
  for (const int factor : {time.day, time.month, time.minute, time.second, time.hour}) {
    if (factor != 0) {
      seed *= static_cast<unsigned>(factor);
    }
  }
  return seed;
}

CShoe::CShoe(int decks)
    : m_nCard(static_cast<std::size_t>(decks * kDeckSize), kNoCard), m_nCount(decks * kDeckSize) {}

void CShoe::Fill() {
  int card = 0;
  for (int& slot : m_nCard) {
    slot = card++ % kDeckSize + 1;
  }
  m_nNext = 0;
}

void CShoe::Shuffle() {
  Fill();
  const unsigned seed = ShuffleSeed(m_nShuffles++, platform::GetLocalTime());
  CheckCards();
  platform::SeedRandom(seed);
  // One exchange per slot with any slot of the shoe: the house's own shuffle, bias and all.
  for (int& slot : m_nCard) {
    const int other = platform::NextRandom() % m_nCount;
    std::swap(slot, m_nCard[static_cast<std::size_t>(other)]);
  }
}

int CShoe::TakeCard() {
  return m_nNext < m_nCount ? m_nCard[static_cast<std::size_t>(m_nNext++)] : kNoCard;
}

void CShoe::TakeOut(const CCardHand& hand) {
  for (int slot = 0; slot < hand.GetCount(); ++slot) {
    const auto next = m_nCard.begin() + m_nNext;
    const auto found = std::find(next, m_nCard.end(), hand.GetCard(slot));
    if (found == m_nCard.end()) continue;
    std::iter_swap(next, found);
    ++m_nNext;
  }
}

void CShoe::StackTop(const std::vector<int>& cards) {
  if (cards.size() > m_nCard.size()) {
    return;
  }
  std::copy_backward(cards.begin(), cards.end(), m_nCard.end());
  m_nNext = m_nCount - static_cast<int>(cards.size());
}

void CShoe::CheckCards() const {
  for (std::size_t slot = 0; slot < m_nCard.size(); ++slot) {
    if (!IsCard(m_nCard[slot])) {
      platform::MessageBox("Trouble in shuffle town(" + std::to_string(slot) + ")");
    }
  }
}

}  // namespace feltside
