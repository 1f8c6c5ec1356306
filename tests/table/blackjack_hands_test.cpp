// Whole hands of blackjack on a stacked shoe, looked at after every step.

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

#include "tests/support/hands.h"
#include "tests/support/stylus.h"

namespace feltside::tests {
namespace {

/// What the player does, and how the table then is told in a line.
struct Step {
  const char* move;
  const char* table;
};

/// Cards come in the order player, player, dealer's hole card, dealer's up card, and then as they
/// are drawn.
struct Hand {
  const char* name;
  const char* cards;
  std::vector<Step> steps;
};

// The wallet, the player's hand, the split hand, the dealer, the flags that are set, and what may
// be done now. The stake is 5.
const std::vector<Hand> kHands = {
    {"a higher total wins",
     "T 9 T 8",
     {{"Deal", "100 | 19 | | | | HSD"}, {"S", "105 | 19 Winner! | | 18 | | Deal"}}},
    {"a lower total loses",
     "T 8 T 9",
     {{"Deal", "100 | 18 | | | | HSD"}, {"S", "95 | 18 Dealer Wins! | | 19 | | Deal"}}},
    {"equal totals move no money",
     "T 9 J 9",
     {{"Deal", "100 | 19 | | | | HSD"}, {"S", "100 | 19 Push! | | 19 | | Deal"}}},
    {"a bust without split settles before the dealer draws",
     "T 6 T 2 K",
     {{"Deal", "100 | 16 | | | | HSD"}, {"H", "95 | 26 Dealer Wins! | | | | Deal"}}},
    {"a hit to 21 ends the turn",
     "T 6 T 2 5 7",
     {{"Deal", "100 | 16 | | | | HSD"}, {"H", "105 | 21 Winner! | | 19 | | Deal"}}},
    {"the dealer busts",
     "T 2 T 6 K",
     {{"Deal", "100 | 12 | | | | HSD"}, {"S", "105 | 12 Winner! | | 26 | | Deal"}}},
    {"a natural is paid 3 to 2", "A K T 9", {{"Deal", "107.5 | Blackjack! | | | | Deal"}}},
    {"a natural is paid against a dealer natural, and no question is asked",
     "A K K A",
     {{"Deal", "107.5 | Blackjack! | | | | Deal"}}},
    {"an ace under a ten settles at once",
     "T 9 A T",
     {{"Deal", "95 | 19 Dealer Wins! | | Blackjack! | | Deal"}}},
    {"insurance taken against a natural costs half the stake",
     "T 9 K A",
     {{"Deal", "100 | 19 | | | | Insurance?"},
      {"Yes", "97.5 | 19 Dealer Wins! | | Blackjack! | insured | Deal"}}},
    {"insurance declined against a natural costs the stake",
     "T 9 K A",
     {{"Deal", "100 | 19 | | | | Insurance?"},
      {"No", "95 | 19 Dealer Wins! | | Blackjack! | | Deal"}}},
    {"insurance taken for nothing costs half the stake and play goes on",
     "T 9 7 A",
     {{"Deal", "100 | 19 | | | | Insurance?"},
      {"Yes", "97.5 | 19 | | | insured | HSD"},
      {"S", "102.5 | 19 Winner! | | 18 | insured | Deal"}}},
    {"insurance declined for nothing costs nothing",
     "T 9 7 A",
     {{"Deal", "100 | 19 | | | | Insurance?"},
      {"No", "100 | 19 | | | | HSD"},
      {"S", "105 | 19 Winner! | | 18 | | Deal"}}},
    {"no move while the insurance question is open",
     "8 8D 7 A",
     {{"Deal", "100 | 16 | | | | Insurance?"},
      {"refused H", "100 | 16 | | | | Insurance?"},
      {"refused S", "100 | 16 | | | | Insurance?"},
      {"refused D", "100 | 16 | | | | Insurance?"},
      {"refused P", "100 | 16 | | | | Insurance?"},
      {"refused Deal", "100 | 16 | | | | Insurance?"},
      {"No", "100 | 16 | | | | HSDP"}}},
    {"a double down wins twice the stake on one card",
     "6 5 T 7 9",
     {{"Deal", "100 | 11 | | | | HSD"}, {"D", "110 | 20 Winner! | | 17 | doubled | Deal"}}},
    {"a double down loses twice the stake",
     "6 5 T 7 2",
     {{"Deal", "100 | 11 | | | | HSD"}, {"D", "90 | 13 Dealer Wins! | | 17 | doubled | Deal"}}},
    {"a double down that busts settles before the dealer draws",
     "T 6 T 2 K",
     {{"Deal", "100 | 16 | | | | HSD"}, {"D", "90 | 26 Dealer Wins! | | | doubled | Deal"}}},
    {"the dealer stands on a soft 17",
     "T 8 6 A",
     {{"Deal", "100 | 18 | | | | Insurance?"},
      {"No", "100 | 18 | | | | HSD"},
      {"S", "105 | 18 Winner! | | 17 | | Deal"}}},
    {"the dealer stands on five cards whatever the total",
     "T 5 2 3 4 2D 3D K",
     {{"Deal", "100 | 15 | | | | HSD"}, {"S", "105 | 15 Winner! | | 14 | | Deal"}}},
    {"the dealer counts an ace as one",
     "T 9 2 3 A T 5",
     {{"Deal", "100 | 19 | | | | HSD"}, {"S", "95 | 19 Dealer Wins! | | 21 | | Deal"}}},
    {"ten and king are no pair",
     "T K 9 8",
     {{"Deal", "100 | 20 | | | | HSD"},
      {"refused P", "100 | 20 | | | | HSD"},
      {"S", "105 | 20 Winner! | | 17 | | Deal"}}},
    {"a split whose main hand busts and whose second hand is doubled",
     "8 8D T 7 5 3 K 9",
     {{"Deal", "100 | 16 | | | | HSDP"},
      {"P", "100 | 13 | 11 | | | HSD"},
      {"refused P", "100 | 13 | 11 | | | HSD"},
      {"H", "100 | 23 Bust | 11 | | second | HSD"},
      {"D", "105 | 23 Dealer Wins! | 20 Winner! | 17 | second doubled second | Deal"}}},
    {"a hit to 21 moves on to the second hand, and there ends the turn",
     "8 8D T 7 3 2 T A T",
     {{"Deal", "100 | 16 | | | | HSDP"},
      {"P", "100 | 11 | 10 | | | HSD"},
      {"H", "100 | 21 | 10 | | second | HSD"},
      {"H", "110 | 21 Winner! | 21 Winner! | 17 | second | Deal"}}},
    {"a double down is possible again on the second hand",
     "8 8D T 7 2 3 4 T",
     {{"Deal", "100 | 16 | | | | HSDP"},
      {"P", "100 | 10 | 11 | | | HSD"},
      {"H", "100 | 14 | 11 | | | HS"},
      {"refused D", "100 | 14 | 11 | | | HS"},
      {"S", "100 | 14 | 11 | | second | HSD"},
      {"H", "100 | 14 Dealer Wins! | 21 Winner! | 17 | second | Deal"}}},
    {"the dealer draws even when both hands have busted",
     "8 8D T 2 5 6 K K 9",
     {{"Deal", "100 | 16 | | | | HSDP"},
      {"P", "100 | 13 | 14 | | | HSD"},
      {"H", "100 | 23 Bust | 14 | | second | HSD"},
      {"H", "90 | 23 Dealer Wins! | 24 Dealer Wins! | 21 | second | Deal"}}},
    {"the main hand doubled after a split",
     "5 5D T 7 6 4 T",
     {{"Deal", "100 | 10 | | | | HSDP"},
      {"P", "100 | 11 | 9 | | | HSD"},
      {"D", "100 | 21 21 | 9 | | doubled second | HSD"},
      {"S", "105 | 21 Winner! | 9 Dealer Wins! | 17 | doubled second | Deal"}}},
    {"the main hand doubled after a split busts",
     "9 9D T 8 6 T K",
     {{"Deal", "100 | 18 | | | | HSDP"},
      {"P", "100 | 15 | 19 | | | HSD"},
      {"D", "100 | 25 Bust! | 19 | | doubled second | HSD"},
      {"S", "95 | 25 Dealer Wins! | 19 Winner! | 18 | doubled second | Deal"}}},
    {"the second hand doubled busts",
     "9 9D T 8 T 6 K",
     {{"Deal", "100 | 18 | | | | HSDP"},
      {"P", "100 | 19 | 15 | | | HSD"},
      {"S", "100 | 19 | 15 | | second | HSD"},
      {"D", "95 | 19 Winner! | 25 Dealer Wins! | 18 | second doubled second | Deal"}}},
    {"21 on two cards after a split is no natural",
     "A AD T 7 K Q",
     {{"Deal", "100 | 12 | | | | HSDP"},
      {"P", "100 | 21 | 21 | | | HSD"},
      {"S", "100 | 21 | 21 | | second | HSD"},
      {"S", "110 | 21 Winner! | 21 Winner! | 17 | second | Deal"}}},
    {"21 after a split may be hit",
     "K KD T 7 A 5 5",
     {{"Deal", "100 | 20 | | | | HSDP"},
      {"P", "100 | 21 | 15 | | | HSD"},
      {"H", "100 | 16 | 15 | | | HS"},
      {"S", "100 | 16 | 15 | | second | HSD"},
      {"S", "90 | 16 Dealer Wins! | 15 Dealer Wins! | 17 | second | Deal"}}},
    {"a full hand takes no more cards",
     "A A T 7 A A A A A A 4 A A A",
     {{"Deal", "100 | 12 | | | | HSDP"},
      {"H", "100 | 13 | | | | HS"},
      {"H", "100 | 14 | | | | HS"},
      {"H", "100 | 15 | | | | HS"},
      {"H", "100 | 16 | | | | HS"},
      {"H", "100 | 17 | | | | HS"},
      {"H", "100 | 18 | | | | HS"},
      {"H", "100 | 12 | | | | HS"},
      {"H", "100 | 13 | | | | HS"},
      {"H", "100 | 14 | | | | HS"},
      {"H", "100 | 15 | | | | S"},
      {"refused H", "100 | 15 | | | | S"},
      {"S", "95 | 15 Dealer Wins! | | 17 | | Deal"}}},
};

/// What stands for each move: on the table and its tool bar, and on the keyboard.
using Door = std::map<std::string, std::string>;
const Door kButtons = {{"Deal", "command 32776"}, {"H", "command 32771"}, {"S", "command 32772"},
                       {"D", "command 32775"},    {"P", "command 32773"}, {"Yes", "tap 56 190"},
                       {"No", "tap 130 190"}};
const Door kKeys = {{"Deal", "key Enter"}, {"H", "key H"},   {"S", "key S"}, {"D", "key D"},
                    {"P", "key P"},        {"Yes", "key I"}, {"No", "key N"}};

void Play(Stylus& stylus, const Door& door, const Hand& hand) {
  SCOPED_TRACE(hand.name);
  stylus.Send("wallet 100");
  stylus.Send(StackOf(hand.cards));
  for (const Step& step : hand.steps) {
    const std::string move = step.move;
    const bool refused = move.rfind("refused ", 0) == 0;
    const std::string& command = door.at(refused ? move.substr(8) : move);
    const Json state = stylus.Send(command);
    ASSERT_EQ(TableLine(state), step.table) << "after " << move;
    if (command[0] == 'c') {
      EXPECT_EQ(state.contains("refused"), refused);
    }
  }
  // Some hands are left in the middle: they are played out, lest the next one could not begin.
  while (!stylus.Send("command 32772").contains("refused")) {
  }
}

class BlackjackHands : public testing::TestWithParam<int> {};

TEST_P(BlackjackHands, ArePlayedByButtons) {
  Stylus stylus("[Settings]\nNUMDECKS = " + std::to_string(GetParam()) + "\n");
  for (const Hand& hand : kHands) Play(stylus, kButtons, hand);
}

TEST_P(BlackjackHands, ArePlayedByKeys) {
  Stylus stylus("[Settings]\nNUMDECKS = " + std::to_string(GetParam()) + "\n");
  for (const Hand& hand : kHands) Play(stylus, kKeys, hand);
}

INSTANTIATE_TEST_SUITE_P(Decks, BlackjackHands, testing::Range(0, 3));

}  // namespace
}  // namespace feltside::tests
