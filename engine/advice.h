#pragma once

#include <string>

#include "engine/blackjack_hand.h"

namespace feltside {

/// A move, as numbers that the play commands are judged by.
enum Advice {
  ADVICE_NONE = -1,
  ADVICE_HIT = 0,
  ADVICE_STAND = 1,
  ADVICE_SPLIT = 2,
  ADVICE_DOUBLE = 3,
};

/// The basic-strategy move for this hand against the dealer's up card, as one of the codes above;
/// strText receives the move in words. Where the strategy has nothing to say (a lone ace, no up
/// card) the code is ADVICE_NONE and strText stays as it was. An empty hand is told to hit, and a
/// pair to split even where no split is left to make.
int GetAdvice(const CBlackjackHand& hand, std::string& strText, int upCard);

}  // namespace feltside
