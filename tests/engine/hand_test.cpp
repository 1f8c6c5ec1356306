#include <gtest/gtest.h>

#include "engine/blackjack_hand.h"

namespace feltside::tests {
namespace {

TEST(CardHand, AddsUpToItsLimit) {
  CCardHand hand;
  EXPECT_EQ(hand.AddCard(52), 0);
  hand.SetLimit(-1);
  EXPECT_EQ(hand.AddCard(52), 0);
  hand.SetLimit(1000);
  while (hand.AddCard(52) == 1) {
  }
  EXPECT_EQ(hand.GetCount(), 27);
  EXPECT_EQ(hand.Clear(), 1);
  EXPECT_EQ(hand.GetLimit(), 27);
  EXPECT_EQ(CBlackjackHand().GetLimit(), 5);
}

}  // namespace
}  // namespace feltside::tests
