#pragma once

#include <cstddef>
#include <sstream>
#include <string>
#include <vector>

#include "engine/card_hand.h"

namespace feltside::tests {

template <class Hand = CCardHand>
Hand MakeHand(const std::vector<int>& cards) {
  Hand hand;
  hand.SetLimit(CCardHand::kSlots);
  for (const int card : cards) {
    hand.AddCard(card);
  }
  return hand;
}

/// From "TS KH A 2": a rank (A, 2 .. 9, T, J, Q, K) and a suit (C, D, H, S) each. Cards without a
/// suit take clubs, diamonds, hearts, spades, clubs, ... by their place.
template <class Hand = CCardHand>
Hand ParseHand(const std::string& text) {
  const std::string ranks = "A23456789TJQK";
  const std::string suits = "CDHS";
  std::vector<int> cards;
  std::istringstream words(text);
  for (std::string word; words >> word;) {
    const std::size_t suit = word.size() > 1 ? suits.find(word[1]) : cards.size() % suits.size();
    cards.push_back(static_cast<int>(suit * ranks.size() + ranks.find(word[0]) + 1));
  }
  return MakeHand<Hand>(cards);
}

inline std::vector<int> CardsOf(const CCardHand& hand) {
  std::vector<int> cards;
  cards.reserve(static_cast<std::size_t>(hand.GetCount()));
  for (int slot = 0; slot < hand.GetCount(); ++slot) {
    cards.push_back(hand.GetCard(slot));
  }
  return cards;
}

}  // namespace feltside::tests
