// Whole deals of video poker on a stacked deck.

#include <gtest/gtest.h>

#include <map>

#include "tests/support/hands.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

/// Five cards as they are dealt, then those that are drawn; the slots that are marked; the hand in
/// the end; its category; and the wallet after a deal at 100 dollars.
struct Deal {
  const char* cards;
  const char* marks;
  const char* hand;
  const char* category;
  double wallet;
};

const std::vector<Deal> kDeals = {
    {"KC TC AC QC JC", "", "AC TC JC QC KC", "Royal Flush", 349},
    {"9H 5H 8H 7H 6H", "", "5H 6H 7H 8H 9H", "Straight Flush", 149},
    {"4C 9S 4D 4H 4S", "", "4C 4D 4H 4S 9S", "Four of a Kind", 119},
    {"5C 9S 5D 9H 5S", "", "5C 5D 5S 9S 9H", "Full House", 106},
    {"2S 9S 5S JS KS", "", "2S 5S 9S JS KS", "Flush", 104},
    {"TS JD QS KD AS", "", "AS TS JD QS KD", "Straight", 103},
    {"7S 7D QS 7H AS", "", "AS 7S 7D 7H QS", "Three of a Kind", 102},
    {"7S 7D QS QH AS", "", "AS 7S 7D QS QH", "Two Pair", 101},
    {"AD 7D QS 3H AS", "", "AD AS 3H 7D QS", "Pair", 99},
    {"QS KD AS 2D 3S", "", "AS 2D 3S QS KD", "Nothing", 99},
    {"KD 9C 7H 5S 2C 3D JH", "24", "2C 7H KD 3D JH", "Nothing", 99},
    {"9C 2C 7H 5S KD 2D 7D", "24", "2C 7H KD 2D 7D", "Two Pair", 101},
    {"2C 5S 7H 9C KD 2D 2H 2S", "345", "2C 5S 2D 2H 2S", "Four of a Kind", 119},
    {"2C 5S 7H 9C KD TH JH QH KH AH", "12345", "TH JH QH KH AH", "Royal Flush", 349},
};

/// The state's hand as the command that would stack it.
std::string StackOfHand(const Json& state) {
  std::string command = "stack";
  for (const Json& card : state["m_handPoker"]) command += " " + card.dump();
  return command;
}

using Door = std::map<std::string, std::string>;
const Door kCards = {{"1", "tap 54 130"},
                     {"2", "tap 87 130"},
                     {"3", "tap 120 130"},
                     {"4", "tap 153 130"},
                     {"5", "tap 186 130"}};

struct Layout {
  const char* name;
  const char* settings;
  Door button;
  Door cards;
};
const std::vector<Layout> kLayouts = {
    {"fancy", "FANCYVP = 1", {{"Deal", "tap 100 200"}, {"Play", "tap 100 200"}}, kCards},
    {"plain", "FANCYVP = 0", {{"Deal", "command 32776"}, {"Play", "tap 120 185"}}, kCards},
    {"keys",
     "FANCYVP = 0",
     {{"Deal", "key Space"}, {"Play", "key Enter"}},
     {{"1", "key 1"}, {"2", "key 2"}, {"3", "key 3"}, {"4", "key 4"}, {"5", "key 5"}}}};

TEST(VideoPoker, PaysWhatIsDrawn) {
  for (const Layout& layout : kLayouts) {
    Stylus stylus(std::string("[Settings]\nGAME_TYPE = 1\nVIDEODISCARDS = 5\n") + layout.settings);
    for (const Deal& deal : kDeals) {
      SCOPED_TRACE(std::string(layout.name) + ": " + deal.cards);
      stylus.Send("wallet 100");
      stylus.Send(StackOf(deal.cards));
      Follow(stylus, {{layout.button.at("Deal"),
                       {{"m_dWallet", 99.0}, {"m_strPlayerMsg", ""}, {"m_bDrawPending", 1}}}});
      for (const char* mark = deal.marks; *mark != 0; ++mark) {
        const Json state = stylus.Send(layout.cards.at(std::string(1, *mark)));
        EXPECT_EQ(state["m_bDiscard"][static_cast<std::size_t>(*mark - '1')], 1);
      }
      const Json state = stylus.Send(layout.button.at("Play"));
      EXPECT_EQ(Missing(state, {{"m_dWallet", deal.wallet},
                                {"m_strPlayerMsg", deal.category},
                                {"m_bDrawPending", 0},
                                {"m_bHandInProgress", 0},
                                {"m_bDiscard", {0, 0, 0, 0, 0}}}),
                "");
      EXPECT_EQ(StackOfHand(state), StackOf(deal.hand));
    }
  }
}

TEST(VideoPoker, DealsAtAnyBalance) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  Follow(stylus, {{"wallet 0"},
                  {StackOf("AD 7D QS 3H AS")},
                  {"tap 100 200", {{"m_dWallet", -1.0}}},
                  {"tap 100 200", {{"m_dWallet", -1.0}, {"m_strPlayerMsg", "Pair"}}},
                  {"wallet 0"},
                  {StackOf("7S 7D QS QH AS")},
                  {"tap 100 200", {{"m_dWallet", -1.0}}},
                  {"tap 100 200", {{"m_dWallet", 1.0}, {"m_strPlayerMsg", "Two Pair"}}}});
}

TEST(VideoPoker, MarksUpToItsLimit) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  const auto marks = [](std::vector<int> flags) { return Json{{"m_bDiscard", flags}}; };
  Follow(stylus, {{"tap 100 200"},
                  {kCards.at("5"), marks({0, 0, 0, 0, 1})},
                  {kCards.at("1"), marks({1, 0, 0, 0, 1})},
                  {"key 3", marks({1, 0, 1, 0, 1})},
                  {kCards.at("2"), marks({1, 0, 1, 0, 1})},
                  {"key 4", marks({1, 0, 1, 0, 1})},
                  {kCards.at("1"), marks({0, 0, 1, 0, 1})},
                  {"key 4", marks({0, 0, 1, 1, 1})},
                  {"key 6", marks({0, 0, 1, 1, 1})},
                  {"key 0", marks({0, 0, 1, 1, 1})},
                  {"tap 100 200", marks({0, 0, 0, 0, 0})},
                  {kCards.at("1"), marks({0, 0, 0, 0, 0})},  // between deals
                  {"key 1", marks({0, 0, 0, 0, 0})}});
}

TEST(VideoPoker, MarksTheCardUnderATap) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  stylus.Send("tap 100 200");
  for (const auto& [tap, marked] : {std::pair{"tap 40 130", 0},
                                    {"tap 41 130", 1},
                                    {"tap 60 130", 0},
                                    {"tap 68 130", 1},
                                    {"tap 69 130", 1},
                                    {"tap 71 130", 1},
                                    {"tap 73 130", 1},
                                    {"tap 54 155", 1}}) {
    EXPECT_EQ(stylus.Send(tap)["m_bDiscard"], Json({marked, 0, 0, 0, 0})) << tap;
  }
}

TEST(VideoPoker, HasItsFancyButtonInOnePlace) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  int pending = 0;
  for (const char* tap : {"tap 70 180", "tap 154 180", "tap 70 214", "tap 154 214"}) {
    pending = 1 - pending;
    EXPECT_EQ(stylus.Send(tap)["m_bDrawPending"], pending) << tap;
  }
  for (const char* tap : {"tap 69 190", "tap 155 190", "tap 100 179", "tap 100 215"}) {
    EXPECT_EQ(stylus.Send(tap)["m_bDrawPending"], pending) << tap;
  }
}

TEST(VideoPoker, HasOnlyItsFixedButtonBeforeTheFirstDeal) {
  Stylus plain("[Settings]\nGAME_TYPE = 1\nFANCYVP = 0");
  Follow(plain,
         {{"tap 120 185", {{"m_bShowTitle", 1}, {"m_bDrawPending", 0}}},
          {"tap 100 200", {{"m_bShowTitle", 1}, {"m_pTitleBitmap", 1}}},
          {"key Enter", {{"m_bShowTitle", 0}, {"m_bDrawPending", 1}, {"m_pTitleBitmap", 0}}}});
  Stylus fancy("[Settings]\nGAME_TYPE = 1");
  Follow(fancy, {{kCards.at("1"), {{"m_bShowTitle", 1}, {"m_pPokerBitmap", 0}}},
                 {"tap 120 160", {{"m_bShowTitle", 1}}},
                 {"tap 100 200", {{"m_bShowTitle", 0}, {"m_pPokerBitmap", 1}}}});
}

TEST(VideoPoker, HasNoBlackjackCommandsAndNoStake) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  const Json dealt = {
      {"m_bDrawPending", 1},
      {"m_nBet", 5},
      {"enabled",
       {{"32771", false}, {"32772", false}, {"32773", false}, {"32775", false}, {"32776", false}}}};
  stylus.Send("key Enter");
  for (const char* input : {"command 32771", "command 32772", "command 32773", "command 32775",
                            "command 32776", "key H", "key S", "key D", "key P", "key B", "key I",
                            "key +", "tap 110 160", "tap 180 107"}) {
    EXPECT_EQ(Missing(stylus.Send(input), dealt), "") << input;
  }
}

TEST(VideoPoker, ShufflesItsDeckForEveryDeal) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1\nNUMDECKS = 0");
  const auto deck = [](int position, int shuffles) {
    return Json{{"m_deck1", {{"position", position}, {"shuffles", shuffles}}}};
  };
  Follow(stylus, {{"key Enter", deck(5, 3)},
                  {"key 1"},
                  {"key Enter", deck(6, 3)},
                  {"key Enter", deck(5, 4)},
                  {"key Enter", deck(5, 4)},
                  {StackOf("2 3 4 5 6 7 8 9 T J"), deck(42, 4)},
                  {"key Enter", deck(47, 4)},
                  {"key 1"},
                  {"key 2"},
                  {"key Enter", deck(49, 4)}});
}

}  // namespace
}  // namespace feltside::tests
