#pragma once

#include <array>
#include <string>

#include "engine/card_hand.h"

namespace feltside {

/// What a poker hand is, in the order of worth.
enum PokerCategory {
  POKER_NOTHING = 0,
  POKER_PAIR = 1,
  POKER_TWO_PAIR = 2,
  POKER_THREE_OF_A_KIND = 3,
  POKER_STRAIGHT = 4,
  POKER_FLUSH = 5,
  POKER_FULL_HOUSE = 6,
  POKER_FOUR_OF_A_KIND = 7,
  POKER_STRAIGHT_FLUSH = 8,
  POKER_ROYAL_FLUSH = 9,
};

/// One line of the pay table: what a category is called and how many dollars a one-dollar stake
/// brings back, the stake included.
struct PokerReturn {
  const char* name;
  int dollars;
};

/// Indexed by PokerCategory.
inline constexpr std::array<PokerReturn, 10> kPokerReturns = {{
    {"Nothing", 0},
    {"Pair", 0},
    {"Two Pair", 2},
    {"Three of a Kind", 3},
    {"Straight", 4},
    {"Flush", 5},
    {"Full House", 7},
    {"Four of a Kind", 20},
    {"Straight Flush", 50},
    {"Royal Flush", 250},
}};

/// The best category that the hand's cards make, 0 to 9. The hand may be in any order and of any
/// size; a number in it that is not a card goes with every suit.
int EvaluatePoker(const CCardHand& hand);

/// Puts the name of the hand's category into strName and returns its dollars.
int ScorePoker(const CCardHand& hand, std::string& strName);

}  // namespace feltside
