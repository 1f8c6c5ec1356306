#include "engine/advice.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string_view>

namespace feltside {

namespace {

// A row of a strategy card: one move for each up card. H hit, S stand, P split, D double down with
// at most two cards, else hit.
using Row = std::string_view;

constexpr std::array<Row, 10> kPairs = {
    // 23456789TA
    "PPPPPPPPPP",  // aces
    "PPPPPPHHHH",  // twos
    "PPPPPPHHHH",  // threes
    "HHHPPHHHHH",  // fours
    "DDDDDDDDHH",  // fives
    "PPPPPHHHHH",  // sixes
    "PPPPPPHHHH",  // sevens
    "PPPPPPPPPP",  // eights
    "PPPPPSPPSS",  // nines
    "SSSSSSSSSS",  // tens, jacks, queens, kings
};

constexpr int kLowestSoft = 13;
constexpr std::array<Row, 9> kSoft = {
    // 23456789TA
    "HHHDDHHHHH",  // 13
    "HHHDDHHHHH",  // 14
    "HHDDDHHHHH",  // 15
    "HHDDDHHHHH",  // 16
    "HDDDDHHHHH",  // 17
    "SDDDDSSHHH",  // 18
    "SSSSSSSSSS",  // 19
    "SSSSSSSSSS",  // 20
    "SSSSSSSSSS",  // 21
};

constexpr int kLowestHard = 8;
constexpr int kHighestHard = 17;
constexpr std::array<Row, 10> kHard = {
    // 23456789TA
    "HHHHHHHHHH",  // 8 and less
    "HDDDDHHHHH",  // 9
    "DDDDDDDDHH",  // 10
    "DDDDDDDDDH",  // 11
    "HHSSSHHHHH",  // 12
    "SSSSSHHHHH",  // 13
    "SSSSSHHHHH",  // 14
    "SSSSSHHHHH",  // 15
    "SSSSSHHHHH",  // 16
    "SSSSSSSSSS",  // 17 and more
};

// The row for this hand; empty where no table has one.
Row FindRow(const CBlackjackHand& hand) {
  const int total = hand.GetTotal();
  if (hand.IsPair() != 0) {
    return kPairs[static_cast<std::size_t>(PointsOf(hand.GetCard(0)) - 1)];
  }
  if (hand.IsSoft() == 0) {
    const int row = std::clamp(total, kLowestHard, kHighestHard) - kLowestHard;
    return kHard[static_cast<std::size_t>(row)];
  }
  return total >= kLowestSoft ? kSoft[static_cast<std::size_t>(total - kLowestSoft)] : Row();
}

std::size_t ColumnOf(int upCard) {
  const int points = PointsOf(upCard);
  return points == kAce ? 9 : static_cast<std::size_t>(points - 2);
}

Advice MoveOf(char letter, int cards) {
  switch (letter) {
    case 'S':
      return ADVICE_STAND;
    case 'P':
      return ADVICE_SPLIT;
    case 'D':
      return cards <= 2 ? ADVICE_DOUBLE : ADVICE_HIT;
    default:
      return ADVICE_HIT;
  }
}

constexpr std::array<const char*, 4> kTexts = {"Hit", "Stand", "Split", "Double Down"};

}  // namespace

int GetAdvice(const CBlackjackHand& hand, std::string& strText, int upCard) {
  const Row row = FindRow(hand);
  if (row.empty() || !IsCard(upCard)) {
    return ADVICE_NONE;
  }
  const Advice advice = MoveOf(row[ColumnOf(upCard)], hand.GetCount());
  strText = kTexts[static_cast<std::size_t>(advice)];
  return advice;
}

}  // namespace feltside
