#include "engine/poker.h"

#include <gmock/gmock.h>

#include "tests/engine/hands.h"

namespace feltside::tests {
namespace {

TEST(Poker, NamesAndPaysHands) {
  struct Case {
    const char* cards;
    const char* name;
    int dollars;
  };
  for (const Case& c : {Case{"A 2 3 4 5", "Straight", 4},
                        Case{"T J Q K A", "Straight", 4},
                        Case{"5H 3H AH 2H 4H", "Straight Flush", 50},
                        Case{"9S TS JS QS KS", "Straight Flush", 50},
                        Case{"KD TD AD QD JD", "Royal Flush", 250},
                        Case{"Q K A 2 3", "Nothing", 0},
                        Case{"J Q K A 2", "Nothing", 0},
                        Case{"K A 2 3 4", "Nothing", 0},
                        Case{"A 9 J Q K", "Nothing", 0},
                        Case{"A A 3 7 9", "Pair", 0},
                        Case{"K 2 K 2 9", "Two Pair", 2},
                        Case{"4 9 4 J 4", "Three of a Kind", 3},
                        Case{"5 5 5 9 9", "Full House", 7},
                        Case{"A A A K K", "Full House", 7},
                        Case{"3 3 8 8 8", "Full House", 7},
                        Case{"K K K K A", "Four of a Kind", 20},
                        Case{"2C 4C 6C 8C TC", "Flush", 5},
                        Case{"QC KC AC 2C 3C", "Flush", 5},
                        Case{"", "Nothing", 0},
                        Case{"A K Q J", "Nothing", 0},
                        Case{"7 7 7 4 4 4", "Full House", 7},
                        Case{"5 6 6 7 8 9", "Straight", 4},
                        Case{"2H TH JH QH KH AH", "Royal Flush", 250}}) {
    std::string name = "something else";
    const CCardHand hand = ParseHand(c.cards);
    EXPECT_EQ(ScorePoker(hand, name), c.dollars) << c.cards;
    EXPECT_EQ(name, c.name) << c.cards;
    EXPECT_EQ(CardsOf(hand), CardsOf(ParseHand(c.cards)));
  }
  EXPECT_EQ(EvaluatePoker(MakeHand({2, 4, 6, 8, 53})), POKER_FLUSH);  // 53 goes with every suit
}

// The ways to be dealt each category are known to every book on the game.
TEST(Poker, CountsEveryFiveCardHand) {
  std::array<int, 10> count = {};
  for (int a = 1; a <= 48; ++a) {
    for (int b = a + 1; b <= 49; ++b) {
      for (int c = b + 1; c <= 50; ++c) {
        for (int d = c + 1; d <= 51; ++d) {
          CCardHand four = MakeHand({a, b, c, d});
          for (int e = d + 1; e <= 52; ++e) {
            CCardHand hand = four;
            hand.AddCard(e);
            ++count[static_cast<std::size_t>(EvaluatePoker(hand))];
          }
        }
      }
    }
  }
  EXPECT_THAT(count,
              testing::ElementsAre(1302540, 1098240, 123552, 54912, 10200, 5108, 3744, 624, 36, 4));
}

}  // namespace
}  // namespace feltside::tests
