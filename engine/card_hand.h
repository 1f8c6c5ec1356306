#pragma once

#include <array>
#include <cstddef>

#include "engine/card.h"

namespace feltside {

/// The cards held in one hand, in the order they came. It knows no game. A plain value: copy it
/// freely.
class CCardHand {
 public:
  static constexpr int kSlots = 27;  ///< no limit is higher

  CCardHand() { Clear(); }

  /// Empties the hand and leaves its limit. Returns 1.
  int Clear();

  /// Puts any number, a card or not, behind the held cards. Returns 1, or 0 with the hand unchanged
  /// when it is at its limit.
  int AddCard(int card);

  /// Takes the first card of this value out; the cards after it move up. Returns 1, or 0 with the
  /// hand unchanged when it holds no such card.
  int RemoveCard(int card);

  /// Sorts by rank (ace low, king high), or by the card's number if bByValue is nonzero; upwards if
  /// bAscending is nonzero, else downwards. Cards that compare equal keep their order.
  void Sort(int bAscending, int bByValue);

  /// 3 clubs, 2 diamonds, 1 hearts, 0 spades, kNoSuit for anything that is not a card.
  static constexpr int GetSuit(int card) {
    return IsCard(card) ? kSuits - 1 - (card - 1) / kRanks : kNoSuit;
  }

  int GetCount() const { return m_nCount; }

  /// The card in this slot; kNoCard outside 0 .. count - 1.
  int GetCard(int slot) const {
    return slot >= 0 && slot < m_nCount ? m_nCard[static_cast<std::size_t>(slot)] : kNoCard;
  }

  /// The most cards that AddCard lets in: 0 at first, so that a hand takes none before its game has
  /// said how many. Limits are held within 0 .. kSlots; cards already in stay.
  int GetLimit() const { return m_nLimit; }
  void SetLimit(int limit);

 private:
  std::array<int, kSlots> m_nCard = {};  // kNoCard from m_nCount on
  int m_nCount = 0;
  int m_nLimit = 0;
};

}  // namespace feltside
