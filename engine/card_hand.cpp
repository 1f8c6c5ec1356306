#include "engine/card_hand.h"

#include <algorithm>
#include <utility>

namespace feltside {

int CCardHand::Clear() {
  m_nCard.fill(kNoCard);
  m_nCount = 0;
  return 1;
}

int CCardHand::AddCard(int card) {
  if (m_nCount >= m_nLimit) {
    return 0;
  }
  m_nCard[static_cast<std::size_t>(m_nCount++)] = card;
  return 1;
}

int CCardHand::RemoveCard(int card) {
  const auto end = m_nCard.begin() + m_nCount;
  const auto found = std::find(m_nCard.begin(), end, card);
  if (found == end) {
    return 0;
  }
  std::copy(found + 1, end, found);
  m_nCard[static_cast<std::size_t>(--m_nCount)] = kNoCard;
  return 1;
}

void CCardHand::Sort(int bAscending, int bByValue) {
  const auto key = [bByValue](int card) { return bByValue != 0 ? card : RankOf(card); };
  for (int pass = 1; pass < m_nCount; ++pass) {
    for (std::size_t k = 0; k + 1 < static_cast<std::size_t>(m_nCount); ++k) {
      const int left = key(m_nCard[k]);
      const int right = key(m_nCard[k + 1]);
      if (bAscending != 0 ? left > right : left < right) {
        std::swap(m_nCard[k], m_nCard[k + 1]);
      }
    }
  }
}

void CCardHand::SetLimit(int limit) { m_nLimit = std::clamp(limit, 0, kSlots); }

}  // namespace feltside
