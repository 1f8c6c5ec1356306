// What stands around a hand of blackjack: the stake, the insurance question, the adviser, the
// shoes.

#include <gtest/gtest.h>

#include "tests/support/hands.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

constexpr char kDeal[] = "command 32776";
constexpr char kHit[] = "command 32771";
constexpr char kStand[] = "command 32772";
constexpr char kSplit[] = "command 32773";
constexpr char kLower[] = "tap 90 160";
constexpr char kRaise[] = "tap 110 160";

/// The stake after a tap, from a stake of 5 or 10.
int StakeAfter(Stylus& stylus, int from, const std::string& tap) {
  while (stylus.Send("state")["m_nBet"] > 5) stylus.Send(kLower);
  if (from > 5) stylus.Send(kRaise);
  return stylus.Send(tap)["m_nBet"];
}

TEST(Stake, IsLoweredAndRaisedByItsButtons) {
  struct Case {
    const char* tap;
    int from5, from10;
  };
  Stylus stylus;
  for (const Case& c :
       {Case{"tap 84 160", 5, 10}, Case{"tap 85 156", 5, 5}, Case{"tap 98 175", 5, 5},
        Case{"tap 85 155", 5, 10}, Case{"tap 85 176", 5, 10},
        Case{"tap 100 160", 10, 10},  // on both: lowered, then raised
        Case{"tap 99 156", 10, 10}, Case{"tap 101 175", 10, 10}, Case{"tap 102 160", 10, 15},
        Case{"tap 118 175", 10, 15}, Case{"tap 119 160", 5, 10}, Case{"tap 118 155", 5, 10},
        Case{"tap 118 176", 5, 10}, Case{"key +", 10, 15}, Case{"key -", 5, 5}}) {
    EXPECT_EQ(StakeAfter(stylus, 5, c.tap), c.from5) << c.tap;
    EXPECT_EQ(StakeAfter(stylus, 10, c.tap), c.from10) << c.tap;
  }
  EXPECT_EQ(stylus.Send("state")["m_bShowTitle"], 1);  // all of that before the first deal
}

TEST(Stake, IsHeldByTheWallet) {
  Stylus stylus;
  Follow(stylus, {{"wallet 3"},
                  {kRaise, {{"m_nBet", 5}}},
                  {kLower, {{"m_nBet", 5}}},
                  {"key +", {{"m_nBet", 5}}},
                  {"wallet 12.50"},
                  {kRaise, {{"m_nBet", 10}}},
                  {kRaise, {{"m_nBet", 15}}},
                  {kRaise, {{"m_nBet", 15}}},
                  {"wallet 15", {{"m_nBet", 15}}},
                  {kRaise, {{"m_nBet", 15}}},
                  {"wallet 3", {{"m_nBet", 15}}},
                  {kRaise, {{"m_nBet", 15}}},
                  {kLower, {{"m_nBet", 10}}}});
}

TEST(Stake, StaysWhileAHandIsPlayedAndMayBeLostOnCredit) {
  Stylus stylus;
  Follow(stylus, {{kRaise},
                  {"wallet 3"},
                  {StackOf("T 8 T 9")},
                  {kDeal, {{"m_dWallet", 3.0}}},
                  {kRaise, {{"m_nBet", 10}}},
                  {kLower, {{"m_nBet", 10}}},
                  {"key +", {{"m_nBet", 10}}},
                  {"key -", {{"m_nBet", 10}}},
                  {kStand, {{"m_dWallet", -7.0}, {"m_nBet", 10}}},
                  {StackOf("A K T 9")},
                  {kDeal, {{"m_dWallet", 8.0}}}});
}

TEST(Insurance, IsAnsweredOnItsButtonsOnly) {
  Stylus stylus;
  const auto answered = [&stylus](const std::string& input) {
    stylus.Send(StackOf("T 9 7 A"));
    stylus.Send(kDeal);
    const Json state = stylus.Send(input);
    const bool open = state["m_bInsuranceOffered"] == 1;
    std::string answer = open ? "open" : state["m_bInsuranceTaken"] == 1 ? "yes" : "no";
    stylus.Send("key N");
    stylus.Send(kStand);
    return answer;
  };
  const std::vector<std::pair<const char*, const char*>> inputs = {
      {"tap 56 190", "yes"},   {"tap 128 206", "yes"},  {"tap 55 198", "open"},
      {"tap 129 198", "open"}, {"tap 130 190", "no"},   {"tap 202 206", "no"},
      {"tap 203 198", "open"}, {"tap 90 189", "open"},  {"tap 90 207", "open"},
      {"tap 90 160", "open"},  {"tap 160 207", "open"}, {"key I", "yes"},
      {"key N", "no"},         {"key Enter", "open"},   {"key H", "open"}};
  for (const auto& [input, answer] : inputs) EXPECT_EQ(answered(input), answer) << input;
}

TEST(Adviser, ShowsItsAdviceOnRequest) {
  Stylus stylus;
  const Json shown = {{"m_bShowAdvice", 1}};
  const Json hidden = {{"m_bShowAdvice", 0}};
  Follow(stylus, {{"tap 180 118", hidden},  // no table has been painted yet
                  {"key B", hidden},
                  {StackOf("8 8D T 7 9 4 5")},
                  {kDeal, hidden},
                  {"tap 167 118", hidden},
                  {"tap 192 118", hidden},
                  {"tap 180 106", hidden},
                  {"tap 180 129", hidden},
                  {"tap 168 107", shown},
                  {"tap 168 107", shown},
                  {kSplit, hidden},  // the advice was for a hand that is no more
                  {"tap 191 128", shown},
                  {kStand, shown},
                  {kStand, shown},
                  {kDeal, hidden}});
  stylus.Send("key N");
  stylus.Send(kStand);
  Follow(stylus, {{kStand, {{"refused", true}}}, {"key B", shown}});
}

TEST(Adviser, JudgesTheMovesOfTheActiveHand) {
  const auto verdict = [](int correct) {
    return Json{{"m_bShowVerdict", 1}, {"m_bVerdictCorrect", correct}};
  };
  Stylus stylus;
  Follow(stylus, {{StackOf("8 8D T 7 9 4 5")},
                  {kDeal, {{"m_bShowVerdict", 0}}},
                  {kSplit, verdict(1)},
                  {kStand, verdict(1)},  // on 17
                  {kHit, verdict(1)},    // on the second hand's 12
                  {kStand, verdict(1)},
                  {StackOf("T 2 T 7 2 9")},
                  {kDeal, {{"m_bShowVerdict", 0}}},
                  {kHit, verdict(1)},
                  {kStand, verdict(0)},
                  {StackOf("6 5 T 6 9")},
                  {kDeal},
                  {kHit, verdict(0)},
                  {kStand},
                  {StackOf("6 5 T 6 9")},
                  {kDeal},
                  {"command 32775", verdict(1)}});
}

TEST(Adviser, JudgesOnlyWhenAskedForAdviceByItsButton) {
  for (const char* mode : {"0", "2"}) {
    Stylus stylus(std::string("[Settings]\nSTRATTYPE = ") + mode);
    const Json silent = {{"m_bShowVerdict", 0}, {"m_bShowAdvice", 0}};
    Follow(stylus, {{StackOf("8 8D T 7 9 4 5 2")},
                    {kDeal, silent},
                    {"tap 180 118", silent},
                    {"key B", silent},
                    {kSplit, silent},
                    {kHit, silent},
                    {kStand, silent}});
  }
}

TEST(Shoes, AreShuffledUnlessFewCardsRemain) {
  const std::vector<std::pair<const char*, int>> shoes = {
      {"m_deck1", 52}, {"m_shoe4", 208}, {"m_shoe6", 312}};
  for (std::size_t choice = 0; choice < shoes.size(); ++choice) {
    Stylus stylus("[Settings]\nNUMDECKS = " + std::to_string(choice));
    const auto& [name, count] = shoes[choice];
    const auto shoe = [shoe = std::string(name)](int position, int shuffles) {
      return Json{{shoe, {{"position", position}, {"shuffles", shuffles}}}};
    };
    Follow(stylus, {{"state", shoe(0, 2)},
                    {StackOf("T 9 T 8 2 2 2 2 2 2 2 2 2 2 2"), shoe(count - 15, 2)},
                    {kDeal, shoe(count - 11, 2)},
                    {kStand},
                    {StackOf("T 9 T 8 2 2 2 2 2 2"), shoe(count - 10, 2)},
                    {kDeal, shoe(count - 6, 2)},
                    {kStand},
                    {"key Ctrl+N", shoe(0, 3)},
                    {kDeal, shoe(4, 4)}});
    for (const auto& other : shoes) {
      const int shuffles = other.first == name ? 4 : 3;
      EXPECT_EQ(stylus.Send("state")[other.first]["shuffles"], shuffles);
    }
  }
}

}  // namespace
}  // namespace feltside::tests
