#include <gmock/gmock.h>

#include "engine/blackjack_hand.h"
#include "tests/engine/hands.h"

namespace feltside::tests {
namespace {

using testing::ElementsAre;

TEST(CardHand, KnowsSuits) {
  const std::vector<std::vector<int>> suits = {
      {40, 52}, {27, 39}, {14, 26}, {1, 13}, {-1, 0, 53, 1000}};
  for (std::size_t suit = 0; suit < suits.size(); ++suit) {
    for (const int card : suits[suit]) {
      EXPECT_EQ(CCardHand::GetSuit(card), static_cast<int>(suit)) << card;
    }
  }
}

TEST(CardHand, AddsUpToItsLimit) {
  const auto fill = [](CCardHand& hand) {
    while (hand.AddCard(52) == 1) {
    }
    return hand.GetCount();
  };
  CCardHand hand;
  CBlackjackHand blackjack;
  EXPECT_EQ(fill(hand), 0);
  EXPECT_EQ(fill(blackjack), 5);
  blackjack.SetLimit(12);
  EXPECT_EQ(fill(blackjack), 12);
  hand.SetLimit(1000);
  EXPECT_EQ(fill(hand), 27);
  EXPECT_EQ(hand.Clear(), 1);
  EXPECT_EQ(hand.GetCount(), 0);
  EXPECT_EQ(hand.GetLimit(), 27);
}

TEST(CardHand, RemovesTheFirstOfEquals) {
  CCardHand hand = MakeHand({5, 20, 5, 30});
  EXPECT_EQ(hand.RemoveCard(5), 1);
  EXPECT_THAT(CardsOf(hand), ElementsAre(20, 5, 30));
  EXPECT_EQ(hand.RemoveCard(30), 1);
  EXPECT_EQ(hand.RemoveCard(30), 0);
  EXPECT_EQ(hand.RemoveCard(kNoCard), 0);  // what the empty slots hold is no card of the hand
  EXPECT_THAT(CardsOf(hand), ElementsAre(20, 5));
  EXPECT_EQ(hand.GetCard(2), kNoCard);
  EXPECT_EQ(hand.GetCard(-1), kNoCard);
}

TEST(CardHand, Sorts) {
  struct Case {
    std::vector<int> cards;
    int ascending, byValue;
    std::vector<int> sorted;
  };
  for (const Case& c : std::vector<Case>{{{13, 1, 12}, 1, 0, {1, 12, 13}},
                                         {{13, 1, 12}, 1, 1, {1, 12, 13}},
                                         {{12, 1, 13}, 0, 0, {13, 12, 1}},
                                         {{14, 1}, 1, 0, {14, 1}},
                                         {{1, 14}, 0, 0, {1, 14}},
                                         {{1, 52, 14}, 0, 1, {52, 14, 1}},
                                         {{52, 25, 2, 40}, 1, 0, {40, 2, 25, 52}},
                                         {{}, 1, 0, {}}}) {
    CCardHand hand = MakeHand(c.cards);
    hand.Sort(c.ascending, c.byValue);
    EXPECT_EQ(CardsOf(hand), c.sorted) << testing::PrintToString(c.cards);
  }
}

TEST(BlackjackHand, Scores) {
  struct Case {
    const char* cards;
    int total, pair, soft;
  };
  for (const Case& c :
       {Case{"", 0, 0, 0}, Case{"AC", 11, 0, 1}, Case{"AC KD", 21, 0, 1}, Case{"AC AD", 12, 1, 1},
        Case{"AC AD 9H", 21, 0, 1}, Case{"AC AD TH", 12, 0, 0}, Case{"AC 6D TH", 17, 0, 0},
        Case{"AC AD AH AS AC 6D", 21, 0, 1}, Case{"TC KD", 20, 0, 0}, Case{"JC QD", 20, 0, 0},
        Case{"KC KD", 20, 1, 0}, Case{"7C 7D 7H", 21, 0, 0}, Case{"TC 9D 5H", 24, 0, 0}}) {
    const auto hand = ParseHand<CBlackjackHand>(c.cards);
    EXPECT_EQ(hand.GetTotal(), c.total) << c.cards;
    EXPECT_EQ(hand.IsPair(), c.pair) << c.cards;
    EXPECT_EQ(hand.IsSoft(), c.soft) << c.cards;
  }
  EXPECT_EQ(MakeHand<CBlackjackHand>({kNoCard, 10, 53, 0}).GetTotal(), 10);
  EXPECT_EQ(MakeHand<CBlackjackHand>({kNoCard, kNoCard}).IsPair(), 0);
}

}  // namespace
}  // namespace feltside::tests
