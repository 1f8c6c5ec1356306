#include "engine/shoe.h"

#include <gmock/gmock.h>

namespace feltside::tests {
namespace {

std::vector<int> TakeAll(CShoe& shoe) {
  std::vector<int> cards;
  while (shoe.GetPosition() < shoe.GetCount()) {
    cards.push_back(shoe.TakeCard());
  }
  return cards;
}

template <class Shoe>
class ShoeTest : public testing::Test {};
using Shoes = testing::Types<CSingleDeck, CFourDeckShoe, CSixDeckShoe>;
TYPED_TEST_SUITE(ShoeTest, Shoes, );

TYPED_TEST(ShoeTest, ShufflesAllItsCardsAnewEachTime) {
  TypeParam shoe;
  shoe.Fill();
  const std::vector<int> filled = TakeAll(shoe);
  for (std::size_t slot = 0; slot < filled.size(); ++slot) {
    EXPECT_EQ(filled[slot], static_cast<int>(slot % 52 + 1));
  }
  EXPECT_EQ(shoe.TakeCard(), -1);
  EXPECT_EQ(shoe.GetPosition(), shoe.GetCount());
  EXPECT_EQ(shoe.GetShuffles(), 1U);
  shoe.Shuffle();
  const std::vector<int> first = TakeAll(shoe);
  // One exchange per slot, with any slot of the shoe.
  std::vector<int> expected = filled;
  platform::SeedRandom(ShuffleSeed(1, platform::GetLocalTime()));
  for (int& slot : expected) {
    std::swap(slot, expected[static_cast<std::size_t>(platform::NextRandom()) % expected.size()]);
  }
  EXPECT_EQ(first, expected);
  shoe.Shuffle();
  EXPECT_EQ(shoe.GetShuffles(), 3U);
  EXPECT_EQ(shoe.GetPosition(), 0);
  const std::vector<int> second = TakeAll(shoe);
  EXPECT_NE(first, filled);
  EXPECT_NE(second, first);
  EXPECT_THAT(first, testing::UnorderedElementsAreArray(filled));
  EXPECT_THAT(second, testing::UnorderedElementsAreArray(filled));
}

TYPED_TEST(ShoeTest, DealsStackedCardsAtItsEnd) {
  TypeParam shoe;
  shoe.StackTop({52, 1, 52});
  EXPECT_EQ(shoe.GetPosition(), shoe.GetCount() - 3);
  EXPECT_THAT(TakeAll(shoe), testing::ElementsAre(52, 1, 52));
  shoe.StackTop(std::vector<int>(313, 1));
  EXPECT_EQ(shoe.TakeCard(), -1);
}

TYPED_TEST(ShoeTest, IsNearItsEndWithFifteenCardsLeft) {
  TypeParam shoe;
  shoe.Fill();
  while (shoe.GetPosition() < shoe.GetCount() - 16) shoe.TakeCard();
  EXPECT_FALSE(shoe.IsNearEnd());
  shoe.TakeCard();
  EXPECT_TRUE(shoe.IsNearEnd());
}

TYPED_TEST(ShoeTest, TakesTheCardsOfAHandOut) {
  TypeParam shoe;
  shoe.Shuffle();
  const int eights = shoe.GetCount() / 52;
  CCardHand hand;
  hand.SetLimit(10);
  for (int i = 0; i < eights + 2; ++i) hand.AddCard(8);  // two more than there are
  shoe.TakeOut(hand);
  EXPECT_EQ(shoe.GetPosition(), eights);
  EXPECT_THAT(TakeAll(shoe), testing::AllOf(testing::SizeIs(shoe.GetCount() - eights),
                                            testing::Not(testing::Contains(8))));
}

TEST(Shoe, KnowsItsSizeAndStart) {
  EXPECT_EQ(CSingleDeck().GetCount(), 52);
  EXPECT_EQ(CFourDeckShoe().GetCount(), 208);
  EXPECT_EQ(CSixDeckShoe().GetCount(), 312);
  EXPECT_EQ(CSingleDeck().TakeCard(), 1);
  EXPECT_EQ(CSixDeckShoe().TakeCard(), -1);
}

TEST(Shoe, MixesItsSeedFromTheClock) {
  struct Case {
    unsigned shuffles;
    platform::LocalTime time;
    unsigned seed;
  };
  for (const Case& c :
       {Case{7, {2000, 2, 3, 5, 11, 13}, 30030}, Case{7, {2000, 2, 3, 0, 11, 13}, 6006},
        Case{7, {2000, 2, 3, 5, 0, 13}, 2730}, Case{7, {2000, 2, 3, 5, 11, 0}, 2310},
        Case{1, {2000, 1, 1, 0, 0, 0}, 1}, Case{0x80000001U, {2000, 2, 1, 0, 0, 0}, 2}}) {
    EXPECT_EQ(ShuffleSeed(c.shuffles, c.time), c.seed);
  }
}

}  // namespace
}  // namespace feltside::tests
