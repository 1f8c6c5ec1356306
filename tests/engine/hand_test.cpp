#include <gmock/gmock.h>

#include "engine/blackjack_hand.h"
#include "tests/engine/hands.h"

namespace feltside::tests {
namespace {

using testing::ElementsAre;

TEST(CardHand, AddsUpToItsLimit) {
  CCardHand hand;
  EXPECT_EQ(hand.AddCard(52), 0);
  hand.SetLimit(1000);
  while (hand.AddCard(52) == 1) {
  }
  EXPECT_EQ(hand.GetCount(), 27);
  EXPECT_EQ(CBlackjackHand().GetLimit(), 5);
}

TEST(CardHand, RemovesTheFirstOfEquals) {
  CCardHand hand = MakeHand({5, 20, 5, 30});
  EXPECT_EQ(hand.RemoveCard(5), 1);
  EXPECT_EQ(hand.RemoveCard(kNoCard), 0);  // what the empty slots hold is no card of the hand
  EXPECT_THAT(CardsOf(hand), ElementsAre(20, 5, 30));
}

TEST(CardHand, SortsEitherWayByRankOrNumber) {
  struct Case {
    int ascending, byValue;
    std::vector<int> sorted;
  };
  for (const Case& c : {Case{1, 0, {1, 14, 26, 13}}, Case{1, 1, {1, 13, 14, 26}},
                        Case{0, 0, {26, 13, 1, 14}}, Case{0, 1, {26, 14, 13, 1}}}) {
    CCardHand hand = MakeHand({1, 26, 14, 13});
    hand.Sort(c.ascending, c.byValue);
    EXPECT_EQ(CardsOf(hand), c.sorted);
  }
}

TEST(BlackjackHand, CountsOnlyCards) {
  EXPECT_EQ(MakeHand<CBlackjackHand>({kNoCard, 10, 53, 0}).GetTotal(), 10);
  EXPECT_EQ(MakeHand<CBlackjackHand>({kNoCard, kNoCard}).IsPair(), 0);
}

}  // namespace
}  // namespace feltside::tests
