// The texts of the table, in every phase of both games, can be read on the pictures under them.
//
// The faint lettering of the blackjack picture is ornament, as that whole drawing is, and not
// measured.

#include "tests/render/contrast.h"

#include <gtest/gtest.h>

#include <array>

#include "platform/look.h"
#include "render/number_text.h"
#include "render/table_layout.h"
#include "tests/support/hands.h"

namespace feltside::tests {
namespace {

using platform::Color;
using platform::Font;
using platform::kBlack;
using platform::kWhite;
using platform::MeasureText;
using platform::Point;
using platform::Rect;
using platform::Rgb;

constexpr Color kRed = Rgb(200, 0, 0);
constexpr Point kTableAt{0, 26};
const std::string kDeal = "command 32776";

// The texts of the table, from its state.

Text OnTable(const std::string& string, Point at, Font font, Color color,
             double bound = kReadable) {
  return {string, RectAt(at + kTableAt, {1, 1}), font, color, bound};
}

Text LeftOf(const std::string& string, Point at, Font font, Color color, double bound = kReadable) {
  return OnTable(string, {at.x - MeasureText(font, string).width, at.y}, font, color, bound);
}

Point Corner(int position, int slot) {
  CTableLayout layout;
  platform::CBitmap pixels;
  platform::CSurface surface(pixels);
  layout.Prepare(surface, {0, 0, 240, 268});
  Point at;
  layout.GetCardPos(at.x, at.y, position, slot);
  return at;
}

/// The text in the corner that a fan leaves free at its right.
Text BesideHand(int position, const std::string& string, bool bold = true) {
  return OnTable(string, Corner(position, 4) + Point{39, position == POS_TOP ? 0 : 30}, {11, bold},
                 kRed);
}

std::vector<Text> BlackjackTexts(const Json& state, const std::string& advice) {
  const auto member = [&state](const char* name) { return state[name].get<std::string>(); };
  const Font font{13};
  const double wallet = state["m_dWallet"];
  std::vector<Text> texts = {
      LeftOf("Dealer", Corner(POS_TOP, 0) - Point{10, 0}, {11}, kBlack),
      BesideHand(POS_TOP, member("m_strDealerScore")),
      OnTable("Player", {66 - MeasureText({13, true}, "Player").width / 2, 97}, {13, true}, kBlack),
      LeftOf(NumberText("Wallet: $%.2f", wallet), {110, 120}, font, kBlack),
      LeftOf(NumberText("Current Bet: $%d", state["m_nBet"].get<int>()), {110, 138}, font, kBlack)};
  const bool split = !state["m_handSplit"].empty();
  const int first = split ? POS_BOTTOM_LEFT : POS_BOTTOM;
  texts.push_back(BesideHand(first, member("m_strPlayerScore")));
  texts.push_back(OnTable(member("m_strPlayerMsg"), Corner(first, 0) - Point{0, split ? 16 : 19},
                          split ? Font{11} : Font{14, true}, kRed));
  if (split) {
    texts.push_back(BesideHand(POS_BOTTOM_RIGHT, member("m_strSplitScore")));
    texts.push_back(
        OnTable(member("m_strSplitMsg"), Corner(POS_BOTTOM_RIGHT, 0) - Point{0, 16}, {11}, kRed));
  } else {
    texts.push_back(LeftOf("You", Corner(POS_BOTTOM, 0) + Point{-10, 30}, {11}, kBlack));
  }
  if (!advice.empty()) {
    texts.push_back(OnTable("Basic Strategy says:", {125, 139}, font, kRed));
    texts.push_back(OnTable(advice, {125, 157}, font, kRed));
  }
  return texts;
}

std::vector<Text> FancyPokerTexts(const Json& state) {
  const Font font{15, true};
  return {OnTable(state["m_bHandInProgress"] == 0 ? "Deal" : "Play", {103, 192}, font, kWhite),
          OnTable(NumberText("$%.0f", state["m_dWallet"].get<double>()), {26, 233}, font, kWhite),
          OnTable(state["m_strPlayerMsg"], {135, 235}, font, Rgb(180, 0, 0), kOnlyListed)};
}

std::vector<Text> PlainPokerTexts(const Json& state) {
  const Font font{11};
  const std::string button = state["m_bHandInProgress"] == 0 ? "Deal" : "Play";
  const platform::Size size = MeasureText({22}, button);
  const Point corner = Corner(POS_BOTTOM, 0);
  std::vector<Text> texts = {
      OnTable(button, {120 - size.width / 2, 185 - size.height / 2}, {22}, kBlack, kOnlyListed),
      LeftOf("You", corner + Point{-10, 30}, font, kBlack),
      LeftOf(NumberText("$%.0f", state["m_dWallet"].get<double>()), corner + Point{-10, 16}, font,
             Rgb(91, 152, 139), kOnlyListed),
      BesideHand(POS_BOTTOM, state["m_strPlayerMsg"], false)};
  if (state["m_bFancyBlackjack"] == 0) texts.back().bound = kOnlyListed;
  const std::array<std::array<const char*, 4>, 4> rows = {
      {{"Royal Flush", "250", "Flush", "5"},
       {"Straight Flush", "50", "Straight", "4"},
       {"Four of a Kind", "20", "Three of a Kind", "3"},
       {"Full House", "7", "Two Pair", "2"}}};
  const int width = MeasureText(font, "888").width;
  const std::array<int, 4> columns = {5, 117 - width, 123, 237 - width};
  for (std::size_t i = 0; i < 16; ++i) {
    texts.push_back(OnTable(rows[i / 4][i % 4], {columns[i % 4], 5 + 12 * static_cast<int>(i / 4)},
                            font, kBlack));
  }
  return texts;
}

struct TableCase {
  std::string name;
  std::string settings;
  std::vector<std::string> commands;
  std::string advice = {};
};

const std::string kSixteen = StackOf("TH 6D KS 7C 5D");
const std::string kInsurance = StackOf("9D 7S KC AS");
const std::string kEights = StackOf("8C 8D TS 7H 3S TH KD 9C");
const std::string kPair = StackOf("9C 9H 9S 4S KC 4H 4D");

const std::vector<TableCase> kTables = {
    {"dealt", "", {kSixteen, kDeal}},
    {"advice", "", {kSixteen, kDeal, "key B"}, "Hit"},
    {"advice always", "STRATTYPE = 2", {kEights, kDeal}, "Split"},
    {"green lamp", "", {kSixteen, kDeal, "key H"}},
    {"red lamp, lost", "", {kSixteen, kDeal, "key S"}},
    {"insurance", "", {kInsurance, kDeal}},
    {"insurance, advice", "STRATTYPE = 2", {kInsurance, kDeal}, "No Insurance"},
    {"insured", "", {kInsurance, kDeal, "key I"}},
    {"split", "", {kEights, kDeal, "key P"}},
    {"split, second", "", {kEights, kDeal, "key P", "key D"}},
    {"split, settled", "", {kEights, kDeal, "key P", "key D", "key S"}},
    {"split, lost", "", {StackOf("8C 8D TS JH 3S 2H"), kDeal, "key P", "key S", "key S"}},
    {"doubled", "", {StackOf("8H 3C TD 6S TS 9D"), kDeal, "key D"}},
    {"push", "", {StackOf("QH 9S JD 9C"), kDeal, "key S"}},
    {"natural", "", {StackOf("AH KS 9C 8D"), kDeal}},
    {"bust", "", {StackOf("TC 6D KH 9C QS"), kDeal, "key H"}},
    {"negative wallet", "", {"wallet -1234.5", kSixteen, kDeal}},
    {"poker dealt", "GAME_TYPE = 1", {kPair, kDeal}},
    {"poker drawn", "GAME_TYPE = 1", {kPair, kDeal, "key 4", "key 5", "key Enter"}},
    {"poker negative wallet", "GAME_TYPE = 1", {"wallet -1234", kPair, kDeal, "key 1"}},
    {"plain poker", "GAME_TYPE = 1\nFANCYVP = 0", {kPair, kDeal, "key Enter"}},
    {"plain poker dealt", "GAME_TYPE = 1\nFANCYVP = 0", {kPair, kDeal}},
    {"plain poker on felt", "GAME_TYPE = 1\nFANCYVP = 0\nFANCYBJ = 0", {kPair, kDeal, "key Enter"}},
};

TEST(Contrast, HoldsForTheTextsOfTheTable) {
  for (const TableCase& table : kTables) {
    Stylus stylus("[Settings]\n" + table.settings);
    const Json state = StateAfter(stylus, table.commands);
    std::vector<Text> texts = state["m_nGameType"] == 0     ? BlackjackTexts(state, table.advice)
                              : state["m_bFancyPoker"] != 0 ? FancyPokerTexts(state)
                                                            : PlainPokerTexts(state);
    texts.push_back({"&BlackJack", {2, 2, 30, 24}, platform::kSystemFont, kBlack});
    ExpectReadable(stylus.Shot(), texts, table.name);
  }
}

struct Drawing {
  std::string name;
  Rect part;  ///< of the window
  double bound = kReadable;
};

TEST(Contrast, HoldsForWhatPicturesSayAndForGreyedButtons) {
  struct Case {
    std::string settings;
    std::vector<std::string> commands;
    std::vector<Drawing> drawings;
  };
  const std::vector<Case> cases = {{"", {}, {{"title", {75, 103, 165, 124}}}},
                                   {"",
                                    {kInsurance, kDeal},
                                    {{"Insurance", {61, 220, 124, 230}},
                                     {"Nope", {135, 220, 180, 230}},
                                     {"question mark", {172, 137, 188, 151}},
                                     {"minus, greyed", {86, 185, 96, 195}, kDisabled},
                                     {"plus, greyed", {102, 185, 112, 195}, kDisabled},
                                     {"Hit, greyed", {67, 5, 83, 20}, kDisabled},
                                     {"Stand, greyed", {91, 5, 107, 20}, kDisabled},
                                     {"Double Down, greyed", {120, 5, 136, 20}, kDisabled},
                                     {"Split, greyed", {149, 5, 165, 20}, kDisabled},
                                     {"Deal, greyed", {178, 5, 194, 20}, kDisabled}}},
                                   {"GAME_TYPE = 1",
                                    {kPair, kDeal},
                                    {{"VIDEO", {25, 45, 56, 52}},
                                     {"Feltside", {76, 41, 164, 58}},
                                     {"POKER", {182, 45, 217, 52}},
                                     {"$1", {204, 214, 216, 222}},
                                     {"A DEAL", {197, 225, 222, 232}},
                                     {"WALLET", {8, 246, 35, 253}},
                                     {"RESULT", {124, 246, 149, 253}}}}};
  for (const Case& screen : cases) {
    Stylus stylus("[Settings]\n" + screen.settings);
    StateAfter(stylus, screen.commands);
    for (const auto& [name, part, bound] : screen.drawings) {
      ExpectVisible(stylus.Shot(), part, bound, name);
    }
  }
}

TEST(Contrast, HoldsForThePayTableInThePicture) {
  Stylus stylus("[Settings]\nGAME_TYPE = 1");
  StateAfter(stylus, {kPair, kDeal});
  const std::array<std::array<int, 2>, 4> columns = {{{13, 80}, {95, 115}, {125, 196}, {216, 226}}};
  for (int cell = 0; cell < 16; ++cell) {
    const auto [left, right] = columns[static_cast<std::size_t>(cell % 4)];
    const int top = 71 + 16 * (cell / 4);
    ExpectVisible(stylus.Shot(), {left, top, right, top + 10}, kReadable,
                  "pay table, cell " + std::to_string(cell));
  }
}

}  // namespace
}  // namespace feltside::tests
