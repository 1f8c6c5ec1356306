// The table in every phase of both games: as a person has looked at it, every text readable, and
// texts and pictures at their pixels.

#include <gtest/gtest.h>

#include "platform/draw/look.h"
#include "platform/draw/resources.h"
#include "render/money_text.h"
#include "shell/res/pictures.h"
#include "tests/render/contrast.h"
#include "tests/support/golden.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::kBlack;
using platform::kWhite;
using platform::MeasureText;
using platform::Point;
using platform::Rgb;

using Texts = std::vector<std::string>;

constexpr platform::Color kRed = Rgb(200, 0, 0);

const Style kNormal{{11}, kBlack};
const Style kMessage{{11}, kRed};
const Style kTotal{{11, true}, kRed};
const Style kResult{{14, true}, kRed};
const Style kBox{{13}, kBlack};
const Style kBoxTitle{{13, true}, kBlack};
const Style kAdvice{{13}, kRed};
const Style kCell{{15, true}, kWhite};
// Both colours are fixed.
const Style kResultCell{{15, true}, Rgb(180, 0, 0), kOnlyListed};
const Style kButton{{22}, kBlack, kOnlyListed};
const Style kAmount{{11}, Rgb(91, 152, 139), kOnlyListed};

std::vector<Style> StylesOn(bool felt) {
  const double onFelt = felt ? kOnlyListed : kReadable;
  return {kNormal,
          {{11}, kRed, onFelt},
          {{11, true}, kRed, onFelt},
          kResult,
          kBox,
          kBoxTitle,
          kAdvice,
          kCell,
          kButton,
          kResultCell,
          kAmount};
}

struct Frame {
  std::string golden;  ///< empty: no picture of it is kept
  std::string settings;
  Texts commands;
  Texts advice = {};
};

const std::string kDeal = "command 32776";
const std::string kSixteen = StackOf("TH 6D KS 7C 5D");
const std::string kInsurance = StackOf("TH 6D KS AC");
const std::string kEights = StackOf("8H 8S TC 7C 3D 9D 2S 9C");
const std::string kEleven = StackOf("6H 5S TC 7D 9H");
const std::string kPoker = StackOf("7S 7D QS QH AS 2C");
const std::string kHeading = "Basic Strategy says:";

const std::vector<Frame> kFrames = {
    {"blackjack_title", "", {}},
    {"blackjack_dealt", "", {kSixteen, kDeal}},
    {"blackjack_insurance", "", {kInsurance, kDeal, "tap 180 118"}, {kHeading, "No Insurance"}},
    {"", "", {StackOf("TH 6D 7S AC"), kDeal, "key I", "key B"}, {kHeading, "Hit"}},
    {"", "STRATTYPE = 2", {kEights, kDeal}, {kHeading, "Split"}},
    {"", "", {kEights, kDeal, "key P", "key S"}},
    {"", "", {kEights, kDeal, "key P", "key S", "key B"}, {kHeading, "Stand"}},
    {"blackjack_colors",
     "FANCYBJ = 0\nTABLECOLOR = 13166335\nBOXCOLOR = 16760960\nCARDBACK = 64",
     {kEights, kDeal, "key P"}},
    {"", "", {StackOf("TH 6D 7S AC"), kDeal, "tap 56 190"}},
    {"", "", {kEleven, kDeal, "key S", "tap 110 160"}},
    {"", "STRATTYPE = 2", {kSixteen, kDeal, "key S"}},
    {"", "", {kSixteen, kDeal, "key B", "key S"}},
    {"blackjack_split", "CARDBACK = 61", {kEights, kDeal, "key P", "key S", "key H"}},
    {"", "", {kEights, kDeal, "key P", "key D", "key S"}},
    {"", "", {StackOf("8C 8D TS JH 3S 2H"), kDeal, "key P", "key S", "key S"}},
    {"blackjack_settled", "", {"tap 110 160", kEleven, kDeal, "key D"}},
    {"", "", {kSixteen, kDeal, "key S"}},
    {"", "", {kSixteen, kDeal, "key H"}},
    {"", "", {StackOf("QH 9S JD 9C"), kDeal, "key S"}},
    {"", "", {StackOf("TC 6D KH 9C QS"), kDeal, "key H"}},
    {"blackjack_natural", "FANCYBJ = 0", {StackOf("AH KS TC 7D"), kDeal}},
    {"blackjack_five_cards",
     "STRATTYPE = 0",
     {StackOf("2H 3S TC 7D 2D 4C 5C"), kDeal, "key H", "key H", "key H"}},
    {"blackjack_negative_wallet", "", {"wallet -5.5", StackOf("TH 8D KS 9C"), kDeal, "key S"}},
    {"blackjack_advice", "STRATTYPE = 2", {kEleven, kDeal}, {kHeading, "Double Down"}},
    {"poker_dealt", "GAME_TYPE = 1", {kPoker, kDeal}},
    {"poker_marked", "GAME_TYPE = 1\nCARDBACK = 59", {kPoker, kDeal, "key 1", "key 4", "key 5"}},
    {"poker_won", "GAME_TYPE = 1", {kPoker, kDeal, "key 1", "key Enter"}},
    {"poker_negative_wallet", "GAME_TYPE = 1", {"wallet -12.5", kPoker, kDeal, "key Enter"}},
    {"plain_poker_dealt", "GAME_TYPE = 1\nFANCYVP = 0", {kPoker, kDeal}},
    {"plain_poker_marked",
     "GAME_TYPE = 1\nFANCYVP = 0\nFANCYBJ = 0\nVIDEODISCARDS = 5",
     {kPoker, kDeal, "key 1", "key 2", "key 3", "key 4", "key 5"}},
    {"plain_poker_won", "GAME_TYPE = 1\nFANCYVP = 0", {kPoker, kDeal, "key 1", "key Enter"}},
    {"plain_poker_negative_wallet",
     "GAME_TYPE = 1\nFANCYVP = 0\nFANCYBJ = 0",
     {"wallet -2.5", kPoker, kDeal, "key Enter"}},
};

/// The program in that phase.
std::unique_ptr<Stylus> ProgramAt(const Frame& frame) {
  auto stylus = std::make_unique<Stylus>("[Settings]\n" + frame.settings);
  for (const std::string& command : frame.commands) Do(*stylus, command);
  return stylus;
}

CBitmap TableOf(Stylus& stylus) {
  CBitmap table({240, 268});
  platform::CSurface(table).BitBlt({}, {240, 268}, stylus.Shot(), {0, 26});
  return table;
}

/// All texts that the table shows in this state.
Texts TextsOf(const Json& state) {
  if (state["m_bShowTitle"] == 1) return {};
  const double wallet = state["m_dWallet"];
  if (state["m_nGameType"] == 0) {
    Texts texts = {"Dealer", "Player", "Wallet: " + MoneyText(wallet, 2),
                   "Current Bet: " + MoneyText(state["m_nBet"], 0)};
    if (state["m_handSplit"].empty()) texts.push_back("You");
    for (const char* member : {"m_strPlayerScore", "m_strPlayerMsg", "m_strSplitScore",
                               "m_strSplitMsg", "m_strDealerScore"}) {
      texts.push_back(state[member]);
    }
    return texts;
  }
  Texts texts = {state["m_bHandInProgress"] == 0 ? "Deal" : "Play", state["m_strPlayerMsg"]};
  if (state["m_bFancyPoker"] == 1) {
    texts.push_back(MoneyText(std::floor(wallet + 0.5), 0));
  } else {
    // A single digit might be found on a card; it stands on the same white as all of these.
    for (const char* text :
         {"You", "Royal Flush", "250", "Flush", "Straight Flush", "50", "Straight",
          "Four of a Kind", "20", "Three of a Kind", "Full House", "Two Pair"}) {
      texts.push_back(text);
    }
    texts.push_back(MoneyText(std::trunc(wallet), 0));
  }
  return texts;
}

TEST(Frames, LookAsTheyDidAndCanBeRead) {
  for (const Frame& frame : kFrames) {
    SCOPED_TRACE(testing::PrintToString(frame.commands) + frame.settings);
    const auto stylus = ProgramAt(frame);
    const CBitmap table = TableOf(*stylus);
    if (!frame.golden.empty()) ExpectGolden(table, frame.golden);
    const Json state = stylus->Send("state");
    // The felt's colour is the player's choice.
    const bool felt = state["m_bFancyBlackjack"] == 0;
    ExpectReadable(table, TextsOf(state), StylesOn(felt));
    ExpectReadable(table, frame.advice, StylesOn(felt));
    EXPECT_EQ(PlacesOf(table, kHeading, kAdvice).empty(), frame.advice.empty());
    // Every operation has painted what it changed: painting anew brings nothing else.
    stylus->Send("wallet " + state["m_dWallet"].dump());
    EXPECT_EQ(TableOf(*stylus), table);
  }
}

struct PlacedText {
  std::string text;
  Style style;
  Point at;
};
struct PlacedPicture {
  int number;
  Point at;
  platform::Size size;  ///< what can be seen of it
};
struct PlacedFrame {
  Frame frame;
  std::vector<PlacedText> texts;
  std::vector<PlacedPicture> pictures;
};

/// Where a text begins that ends at a place.
int Before(int right, const std::string& text, int height) {
  return right - MeasureText(platform::Font{height}, text).width;
}

TEST(Frames, HaveEverythingAtItsPixels) {
  const int button = MeasureText({22}, "Play").width / 2;
  const int title = MeasureText({13, true}, "Player").width / 2;
  const std::vector<PlacedFrame> frames = {
      {{"", "", {kInsurance, kDeal}},
       {{"Dealer", kNormal, {Before(69, "Dealer", 11), 10}},
        {"You", kNormal, {Before(69, "You", 11), 247}},
        {"16", kTotal, {154, 247}},
        {"Player", kBoxTitle, {66 - title, 97}},
        {"Wallet: $100.00", kBox, {Before(110, "Wallet: $100.00", 13), 120}},
        {"Current Bet: $5", kBox, {Before(110, "Current Bet: $5", 13), 138}}},
       {{54, {79, 10}, {9, 41}},
        {1, {88, 10}, {29, 41}},
        {36, {79, 217}, {9, 41}},
        {19, {88, 217}, {29, 41}},
        {133, {168, 107}, {24, 22}},
        {139, {56, 190}, {73, 17}},
        {143, {130, 190}, {55, 17}}}},
      {{"", "", {kEleven, kDeal, "key B"}},
       {{kHeading, kAdvice, {125, 139}}, {"Double Down", kAdvice, {125, 157}}},
       {}},
      {{"", "", {kEights, kDeal, "key P", "key D", "key S"}},
       {{"13", kTotal, {94, 247}},
        {"17", kTotal, {214, 247}},
        {"17", kTotal, {154, 10}},
        {"Dealer Wins!", kMessage, {19, 201}},
        {"Push!", kMessage, {139, 201}}},
       {{141, {16, 97}, {13, 13}}}},
      {{"", "", {kSixteen, kDeal, "key H"}}, {{"Winner!", kResult, {79, 198}}}, {}},
      {{"", "FANCYVP = 0\nGAME_TYPE = 1", {kPoker, kDeal, "key 5"}},
       {{"Royal Flush", kNormal, {5, 5}},
        {"Straight", kNormal, {123, 17}},
        {"Two Pair", kNormal, {123, 41}},
        {"250", kNormal, {117 - MeasureText({11}, "888").width, 5}},
        {"Play", kButton, {120 - button, 174}},
        {"$99", kAmount, {Before(69, "$99", 11), 233}}},
       {{40, {40, 114}, {29, 41}}, {54, {172, 114}, {29, 41}}}},
      {{"", "GAME_TYPE = 1", {kPoker, kDeal, "key Enter"}},
       {{"Deal", kCell, {103, 192}},
        {"$101", kCell, {26, 233}},
        {"Two Pair", kResultCell, {135, 235}}},
       {}}};
  platform::CResources pictures(PictureFiles());
  for (const PlacedFrame& placed : frames) {
    const CBitmap table = TableOf(*ProgramAt(placed.frame));
    for (const PlacedText& text : placed.texts) {
      const auto places = PlacesOf(table, text.text, text.style);
      EXPECT_EQ(std::count(places.begin(), places.end(), text.at), 1) << text.text;
    }
    for (const auto& [number, at, size] : placed.pictures) {
      CBitmap shown(size);
      CBitmap picture(size);
      platform::CSurface(shown).BitBlt({}, size, table, at);
      platform::CSurface(picture).BitBlt({}, size, pictures.LoadBitmap(number, size));
      ExpectSame(shown, picture, "picture_" + std::to_string(number));
    }
  }
}

struct Drawing {
  platform::Rect part;
  double bound = kReadable;
};

TEST(Frames, ShowWhatIsWrittenInPicturesAndGreyedButtons) {
  struct Screen {
    Frame frame;
    std::vector<Drawing> drawings;  ///< in the window
  };
  std::vector<Screen> screens = {{{"", "", {}}, {{{75, 103, 165, 124}}}},
                                 {{"", "", {kInsurance, kDeal}},
                                  {{{61, 220, 124, 230}},
                                   {{135, 220, 180, 230}},
                                   {{172, 137, 188, 151}},
                                   // Greyed: the stake and the five moves.
                                   {{86, 185, 96, 195}, kDisabled},
                                   {{102, 185, 112, 195}, kDisabled},
                                   {{67, 5, 83, 20}, kDisabled},
                                   {{91, 5, 107, 20}, kDisabled},
                                   {{120, 5, 136, 20}, kDisabled},
                                   {{149, 5, 165, 20}, kDisabled},
                                   {{178, 5, 194, 20}, kDisabled}}},
                                 {{"", "GAME_TYPE = 1", {kPoker, kDeal}},
                                  {{{25, 45, 56, 52}},
                                   {{76, 41, 164, 58}},
                                   {{182, 45, 217, 52}},
                                   {{204, 214, 216, 222}},
                                   {{197, 225, 222, 232}},
                                   {{8, 246, 35, 253}},
                                   {{124, 246, 149, 253}}}}};
  for (int row = 71; row < 71 + 4 * 16; row += 16) {  // the pay table
    for (const auto& [left, right] : {std::pair{13, 80}, {95, 115}, {125, 196}, {216, 226}}) {
      screens[2].drawings.push_back({{left, row, right, row + 10}});
    }
  }
  for (const Screen& screen : screens) {
    const CBitmap shot = ProgramAt(screen.frame)->Shot();
    for (const auto& [part, bound] : screen.drawings) ExpectVisible(shot, part, bound);
  }
}

TEST(Frames, ShowTheTitleWhateverTheGame) {
  EXPECT_EQ(TableOf(*ProgramAt({"", "", {}})),
            TableOf(*ProgramAt({"", "GAME_TYPE = 1\nFANCYVP = 0", {}})));
}

}  // namespace
}  // namespace feltside::tests
