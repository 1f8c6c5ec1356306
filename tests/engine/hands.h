#pragma once

#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <vector>

#include "engine/card_hand.h"
#include "engine/card_text.h"

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

/// From "TS 10H AC"; fails the test where a word is no card.
template <class Hand = CCardHand>
Hand ParseHand(const std::string& text) {
  std::vector<int> cards;
  std::istringstream words(text);
  for (std::string word; words >> word;) {
    cards.push_back(CardFromText(word));
    EXPECT_TRUE(IsCard(cards.back())) << word;
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
