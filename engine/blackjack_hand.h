#pragma once

#include "engine/card_hand.h"

namespace feltside {

/// The best total of a hand; more is a bust.
inline constexpr int kTwentyOne = 21;

/// A hand that knows what it is worth in blackjack. It starts with a limit of five cards.
class CBlackjackHand : public CCardHand {
 public:
  CBlackjackHand() { SetLimit(5); }

  /// The hand's total with one ace raised to 11 where that does not bust; 0 for an empty hand. Not
  /// capped: it is more than 21 for a busted hand.
  int GetTotal() const;

  /// 1 if the hand is exactly two cards of one rank, else 0. A jack and a king are no pair.
  int IsPair() const;

  /// 1 if the total counts an ace as 11, else 0.
  int IsSoft() const;

 private:
  int HardTotal() const;  // every ace counted as 1
  bool HasAce() const;
};

}  // namespace feltside
