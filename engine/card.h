#pragma once

// A card is an int from 1 to 52: four suits of thirteen, each ace, 2 .. 10, jack, queen, king, in
// the order clubs, diamonds, hearts, spades. The number is also that of the card's picture.

#include <algorithm>

namespace feltside {

inline constexpr int kRanks = 13;
inline constexpr int kDeckSize = 52;

inline constexpr int kNoCard = -1;  ///< what an empty slot holds

inline constexpr int kAce = 1;
inline constexpr int kKing = 13;

// Suit numbers, as GetSuit of a hand returns them.
inline constexpr int kSuits = 4;
inline constexpr int kNoSuit = 4;  ///< of anything that is not a card

constexpr bool IsCard(int card) { return card >= 1 && card <= kDeckSize; }

/// 1 (ace, always low) to 13 (king). Only a card has a rank worth asking for; of other numbers it
/// returns some number not above 13.
constexpr int RankOf(int card) {
  const int remainder = card % kRanks;
  return remainder == 0 ? kKing : remainder;
}

/// What a card counts in blackjack with the ace low: 1 to 10, or 0 if it is not a card.
constexpr int PointsOf(int card) { return IsCard(card) ? std::min(RankOf(card), 10) : 0; }

}  // namespace feltside
