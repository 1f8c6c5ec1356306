#include "engine/poker.h"

#include <algorithm>
#include <cstddef>

namespace feltside {

namespace {

// All tests take a hand that is sorted upwards by rank, in which an ace stands first.

constexpr int kHandSize = 5;  // cards in a straight or a flush

int RankAt(const CCardHand& sorted, int slot) { return RankOf(sorted.GetCard(slot)); }

// Neighbouring ranks, each one higher than the one before, counted without repetitions.
struct RankRun {
  int length = 1;
  int start = 0;  // slot of its lowest card
};

const RankRun& LongerRun(const RankRun& best, const RankRun& run) {
  return run.length > best.length ? run : best;
}

bool SpansAceToKing(const CCardHand& sorted) {
  return RankAt(sorted, 0) == kAce && RankAt(sorted, sorted.GetCount() - 1) == kKing;
}

// An ace counts below the two and, once more, above the king.
RankRun LongestRankRun(const CCardHand& sorted) {
  RankRun best;
  RankRun run;
  for (int slot = 0; slot + 1 < sorted.GetCount(); ++slot) {
    const int step = RankAt(sorted, slot + 1) - RankAt(sorted, slot);
    if (step == 1) {
      run.start = run.length == 1 ? slot : run.start;
      ++run.length;
    } else if (step != 0) {
      best = LongerRun(best, run);
      run = RankRun();
    }
  }
  if (run.length > 1 && SpansAceToKing(sorted)) {
    ++run.length;
  }
  return LongerRun(best, run);
}

bool IsStraight(const CCardHand& sorted) { return LongestRankRun(sorted).length >= kHandSize; }

// The cards of the straight, from the lowest up; none if there is no straight.
CCardHand CollectStraight(const CCardHand& sorted) {
  CCardHand straight;
  const RankRun run = LongestRankRun(sorted);
  if (run.length < kHandSize) {
    return straight;
  }
  straight.SetLimit(sorted.GetLimit());
  straight.AddCard(sorted.GetCard(run.start));
  int rank = RankAt(sorted, run.start);
  for (int slot = run.start + 1; slot < sorted.GetCount(); ++slot) {
    if (RankAt(sorted, slot) == rank + 1) {
      straight.AddCard(sorted.GetCard(slot));
      ++rank;
    }
  }
  if (rank == kKing && straight.GetCount() < run.length) {
    straight.AddCard(sorted.GetCard(0));
  }
  return straight;
}

// A number that is not a card goes with every suit.
bool IsFlush(const CCardHand& hand) {
  std::array<int, kSuits + 1> count = {};
  for (int slot = 0; slot < hand.GetCount(); ++slot) {
    ++count[static_cast<std::size_t>(CCardHand::GetSuit(hand.GetCard(slot)))];
  }
  return *std::max_element(count.begin(), count.begin() + kSuits) + count[kNoSuit] >= kHandSize;
}

bool IsStraightFlush(const CCardHand& sorted) { return IsFlush(CollectStraight(sorted)); }

bool IsRoyalFlush(const CCardHand& sorted) {
  CCardHand straight = CollectStraight(sorted);
  straight.Sort(1, 0);
  return IsFlush(straight) && SpansAceToKing(straight);
}

// Whether at least `others` cards of the same rank come after this slot.
bool HasLaterEquals(const CCardHand& sorted, int slot, int others) {
  return slot + others < sorted.GetCount() && RankAt(sorted, slot) == RankAt(sorted, slot + others);
}

bool IsFourOfAKind(const CCardHand& sorted) {
  for (int slot = 0; slot < sorted.GetCount(); ++slot) {
    if (HasLaterEquals(sorted, slot, 3)) {
      return true;
    }
  }
  return false;
}

// Four of a kind count as two triples.
int CountTriples(const CCardHand& sorted) {
  int triples = 0;
  for (int slot = 0; slot < sorted.GetCount(); ++slot) {
    triples += HasLaterEquals(sorted, slot, 2) ? 1 : 0;
  }
  return triples;
}

// Pairs beside at most one triple; 0 with more triples than that.
int CountPairs(const CCardHand& sorted) {
  if (CountTriples(sorted) > 1) {
    return 0;
  }
  int pairs = 0;
  for (int slot = 0; slot < sorted.GetCount(); ++slot) {
    if (HasLaterEquals(sorted, slot, 2)) {
      slot += 2;
    } else if (HasLaterEquals(sorted, slot, 1)) {
      ++pairs;
      ++slot;
    }
  }
  return pairs;
}

bool IsFullHouse(const CCardHand& sorted) {
  const int triples = CountTriples(sorted);
  return triples == 2 || (triples == 1 && CountPairs(sorted) >= 1);
}

PokerCategory Classify(const CCardHand& sorted) {
  if (IsRoyalFlush(sorted)) {
    return POKER_ROYAL_FLUSH;
  }
  if (IsStraightFlush(sorted)) {
    return POKER_STRAIGHT_FLUSH;
  }
  if (IsFourOfAKind(sorted)) {
    return POKER_FOUR_OF_A_KIND;
  }
  if (IsFullHouse(sorted)) {
    return POKER_FULL_HOUSE;
  }
  if (IsFlush(sorted)) {
    return POKER_FLUSH;
  }
  if (IsStraight(sorted)) {
    return POKER_STRAIGHT;
  }
  if (CountTriples(sorted) >= 1) {
    return POKER_THREE_OF_A_KIND;
  }
  const int pairs = CountPairs(sorted);
  return pairs >= 2 ? POKER_TWO_PAIR : pairs == 1 ? POKER_PAIR : POKER_NOTHING;
}

}  // namespace

int EvaluatePoker(const CCardHand& hand) {
  CCardHand sorted = hand;
  sorted.Sort(1, 0);
  return Classify(sorted);
}

int ScorePoker(const CCardHand& hand, std::string& strName) {
  const PokerReturn& line = kPokerReturns[static_cast<std::size_t>(EvaluatePoker(hand))];
  strName = line.name;
  return line.dollars;
}

}  // namespace feltside
