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
  for (const Case& c : {Case{"AC 2D 3H 4S 5C", "Straight", 4},
                        Case{"TC JD QH KS AC", "Straight", 4},
                        Case{"5H 3H AH 2H 4H", "Straight Flush", 50},
                        Case{"9S TS JS QS KS", "Straight Flush", 50},
                        Case{"KD TD AD QD JD", "Royal Flush", 250},
                        Case{"QC KD AH 2S 3C", "Nothing", 0},
                        Case{"JC QD KH AS 2C", "Nothing", 0},
                        Case{"KC AD 2H 3S 4C", "Nothing", 0},
                        Case{"AC 9D JH QS KC", "Nothing", 0},
                        Case{"AC AD 3H 7S 9C", "Pair", 0},
                        Case{"KC 2D KH 2S 9C", "Two Pair", 2},
                        Case{"4C 9D 4H JS 4C", "Three of a Kind", 3},
                        Case{"5C 5D 5H 9S 9C", "Full House", 7},
                        Case{"AC AD AH KS KC", "Full House", 7},
                        Case{"3C 3D 8H 8S 8C", "Full House", 7},
                        Case{"KC KD KH KS AC", "Four of a Kind", 20},
                        Case{"2C 4C 6C 8C TC", "Flush", 5},
                        Case{"QC KC AC 2C 3C", "Flush", 5},
                        Case{"", "Nothing", 0},
                        Case{"AC KD QH JS", "Nothing", 0},
                        Case{"7C 7D 7H 4S 4C 4D", "Full House", 7},
                        Case{"5C 6D 6H 7S 8C 9D", "Straight", 4},
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
