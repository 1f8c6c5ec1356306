// Every drawing operation of the table, pixel by pixel, on a client area of 240 x 268.

#include <gtest/gtest.h>

#include <functional>

#include "render/table_layout.h"
#include "shell/feltside_app.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::Color;
using platform::CSurface;
using platform::Font;
using platform::MeasureText;
using platform::Point;
using platform::Rect;
using platform::Rgb;

constexpr Color kFelt = Rgb(0, 155, 0);
constexpr Color kBox = Rgb(135, 180, 100);
constexpr Color kRed = Rgb(200, 0, 0);

CFeltsideApp& Program() {
  static CFeltsideApp app;
  return app;
}

const CBitmap& Picture(int number) { return Program().Resources().LoadBitmap(number, {1, 1}); }
const CBitmap& Icon(int number) { return Program().Resources().LoadIcon(number, {1, 1}); }

void Ink(CSurface& surface, Point at, const std::string& text, Font font, Color color) {
  surface.DrawStencil(at, RenderText(font, text), color);
}

/// The same with the right edge given.
void InkLeftOf(CSurface& surface, Point at, const std::string& text, Font font, Color color) {
  Ink(surface, {at.x - MeasureText(font, text).width, at.y}, text, font, color);
}

void Frame(CSurface& surface, const Rect& rect, Color fill) {
  surface.FillRect(rect, platform::kBlack);
  surface.FillRect({rect.left + 1, rect.top + 1, rect.right - 1, rect.bottom - 1}, fill);
}

void ExpectBox(CSurface& s, const char* wallet, const char* stake, int minus, int plus) {
  Frame(s, {12, 92, 120, 176}, kBox);
  Frame(s, {12, 92, 120, 115}, kBox);
  const int width = MeasureText({13, true}, "Player").width;
  Ink(s, {66 - width / 2, 97}, "Player", {13, true}, platform::kBlack);
  InkLeftOf(s, {110, 120}, wallet, {13, false}, platform::kBlack);
  InkLeftOf(s, {110, 138}, stake, {13, false}, platform::kBlack);
  s.DrawIcon({83, 156}, Icon(minus));
  s.DrawIcon({99, 156}, Icon(plus));
}

void ExpectPayTable(CSurface& s) {
  Frame(s, {2, 2, 238, 109}, platform::kWhite);
  s.FillRect({120, 0, 121, 109}, platform::kBlack);
  const std::array<std::array<const char*, 4>, 4> rows = {
      {{"Royal Flush", "250", "Flush", "5"},
       {"Straight Flush", "50", "Straight", "4"},
       {"Four of a Kind", "20", "Three of a Kind", "3"},
       {"Full House", "7", "Two Pair", "2"}}};
  const int number = MeasureText({11, false}, "888").width;
  const std::array<int, 4> columns = {5, 120 - number - 3, 123, 237 - number};
  for (int row = 0; row < 4; ++row) {
    for (std::size_t i = 0; i < 4; ++i) {
      Ink(s, {columns[i], 5 + 12 * row}, rows[static_cast<std::size_t>(row)][i], {11, false},
          platform::kBlack);
    }
  }
}

void ExpectButton(CSurface& s, const char* label) {
  Frame(s, {90, 165, 150, 205}, Rgb(0, 100, 255));
  const int width = MeasureText({22, false}, label).width;
  Ink(s, {120 - width / 2, 174}, label, {22, false}, platform::kBlack);
}

CCardHand ThreeCards() {
  CCardHand hand;
  hand.SetLimit(3);
  for (const int card : {1, 52, 20}) hand.AddCard(card);
  return hand;
}

using Layout = const CTableLayout;
struct Drawing {
  const char* name;
  std::function<void(Layout&)> draw;
  std::function<void(CSurface&)> expected;
};

// Operations that do not meet share a sheet.
const std::vector<Drawing> kDrawings = {
    {"cards",
     [](Layout& l) {
       l.DrawHand(POS_BOTTOM, ThreeCards());
       l.DrawCard(POS_TOP, 0, 65);
       l.DrawCardBack(POS_MIDDLE_ROW, 4);
     },
     [](CSurface& s) {
       s.BitBlt({79, 217}, {9, 41}, Picture(1));
       s.BitBlt({88, 217}, {9, 41}, Picture(52));
       s.BitBlt({97, 217}, {29, 41}, Picture(20));
       s.BitBlt({79, 10}, {29, 41}, Picture(65));
       s.BitBlt({172, 114}, {29, 41}, Picture(54));
     }},
    {"nothing",
     [](Layout& l) {
       for (const int number : {-1, 0, 66}) l.DrawCard(POS_BOTTOM, 1, number);
       l.DrawCard(-1, 1, 27);
       l.DrawCard(POS_BOTTOM, -1, 27);
       l.DrawHand(POS_BOTTOM, CCardHand());
       l.DrawHandText(POS_BOTTOM, "", true);
       l.DrawHandText(POS_ABOVE_BOTTOM, "", false);
       l.DrawLabel(POS_TOP, "");
     },
     [](CSurface&) {}},
    {"texts of a hand",
     [](Layout& l) {
       l.DrawLabel(POS_TOP, "Dealer");
       l.DrawHandText(POS_TOP, "Blackjack!", true);
       l.DrawLabel(POS_BOTTOM, "You");
       l.DrawHandText(POS_BOTTOM, "19", true);
       l.DrawHandText(POS_ABOVE_BOTTOM, "Push!", false);
       l.DrawAmount(POS_BOTTOM, -3);
     },
     [](CSurface& s) {
       InkLeftOf(s, {69, 10}, "Dealer", {11, false}, platform::kBlack);
       Ink(s, {154, 10}, "Blackjack!", {11, true}, kRed);
       InkLeftOf(s, {69, 247}, "You", {11, false}, platform::kBlack);
       Ink(s, {154, 247}, "19", {11, true}, kRed);
       Ink(s, {79, 198}, "Push!", {14, true}, kRed);
       InkLeftOf(s, {69, 233}, "$-3", {11, false}, Rgb(91, 152, 139));
     }},
    {"texts of a split",
     [](Layout& l) {
       l.DrawHandText(POS_BOTTOM_LEFT, "12", true);
       l.DrawHandText(POS_BOTTOM_RIGHT, "21", true);
       l.DrawHandText(POS_ABOVE_BOTTOM_LEFT, "Bust", false);
       l.DrawHandText(POS_ABOVE_BOTTOM_RIGHT, "Winner!", false);
     },
     [](CSurface& s) {
       Ink(s, {94, 247}, "12", {11, true}, kRed);
       Ink(s, {214, 247}, "21", {11, true}, kRed);
       Ink(s, {19, 201}, "Bust", {11, false}, kRed);
       Ink(s, {139, 201}, "Winner!", {11, false}, kRed);
     }},
    {"between deals",
     [](Layout& l) {
       l.DrawPlayerBox(5, 100.0, false);
       l.DrawVerdictLamp(true);
     },
     [](CSurface& s) {
       ExpectBox(s, "Wallet: $100.00", "Current Bet: $5", 137, 136);
       s.BitBlt({16, 97}, {13, 13}, Picture(141));
     }},
    {"in play",
     [](Layout& l) {
       l.DrawPlayerBox(25, -5.5, true);
       l.DrawVerdictLamp(false);
       l.DrawStrategyButton();
       l.DrawInsuranceButtons();
       l.DrawAdvice("Double Down");
     },
     [](CSurface& s) {
       ExpectBox(s, "Wallet: $-5.50", "Current Bet: $25", 138, 139);
       s.BitBlt({16, 97}, {13, 13}, Picture(144));
       s.BitBlt({168, 107}, {24, 22}, Picture(133));
       s.BitBlt({56, 190}, {73, 17}, Picture(139));
       s.BitBlt({130, 190}, {55, 17}, Picture(143));
       Ink(s, {125, 139}, "Basic Strategy says:", {13, false}, kRed);
       Ink(s, {125, 157}, "Double Down", {13, false}, kRed);
     }},
    {"pay table and deal button",
     [](Layout& l) {
       l.DrawPayTable();
       l.DrawPlayButton(true);
     },
     [](CSurface& s) {
       ExpectPayTable(s);
       ExpectButton(s, "Deal");
     }},
    {"play button", [](Layout& l) { l.DrawPlayButton(false); },
     [](CSurface& s) { ExpectButton(s, "Play"); }},
};

TEST(Drawing, PutsEveryPixelInItsPlace) {
  Program();
  for (const Drawing& drawing : kDrawings) {
    CBitmap actual({240, 268}, kFelt);
    CSurface surface(actual);
    CTableLayout layout;
    layout.m_crTable = kFelt;
    layout.m_crBox = kBox;
    layout.m_nRowCards = 5;
    layout.Prepare(surface, {0, 0, 240, 268});
    drawing.draw(layout);
    CBitmap expected({240, 268}, kFelt);
    CSurface drawn(expected);
    drawing.expected(drawn);
    ExpectSame(actual, expected, drawing.name);
  }
}

TEST(Drawing, MarksTheActiveHandWithoutCoveringTheTable) {
  for (const auto& [position, left] : {std::pair{POS_BOTTOM_LEFT, 19}, {POS_BOTTOM_RIGHT, 139}}) {
    CBitmap sheet({240, 268}, kFelt);
    CSurface surface(sheet);
    surface.FillRect({left + 4, 200, 240, 268}, Rgb(250, 130, 60));
    const CBitmap before = sheet;
    CTableLayout layout;
    layout.Prepare(surface, {0, 0, 240, 268});
    layout.DrawActiveMarker(position);
    const Rect place = platform::RectAt({left, 208}, {8, 4});
    int marked = 0;
    for (int y = 0; y < 268; ++y) {
      for (int x = 0; x < 240; ++x) {
        const bool inside = place.Contains({x, y});
        const platform::Pixel picture =
            inside ? Picture(IDB_ACTIVE_MARK).At(Point{x, y} - place.TopLeft()) : 0xFFFFFFFFU;
        ASSERT_EQ(sheet.At({x, y}), before.At({x, y}) & picture) << x << ", " << y;
        marked += sheet.At({x, y}) != before.At({x, y}) ? 1 : 0;
      }
    }
    EXPECT_GE(marked, 10);
  }
}

TEST(Drawing, ShowsABlankWithItsNumberForAPictureThatIsMissing) {
  platform::CResources none({nullptr, 0});
  const CBitmap& blank = none.LoadBitmap(77, {29, 41});
  EXPECT_EQ(blank.GetSize(), (platform::Size{29, 41}));
  CBitmap expected({29, 41});
  CSurface surface(expected);
  Frame(surface, {0, 0, 29, 41}, platform::kWhite);
  const int width = MeasureText({11, false}, "77").width;
  Ink(surface, {(29 - width) / 2, 15}, "77", {11, false}, platform::kBlack);
  ExpectSame(blank, expected, "blank");
  EXPECT_EQ(none.LoadIcon(136, {16, 16}).GetSize(), (platform::Size{16, 16}));
  EXPECT_FALSE(none.LoadIconOfSize(128, 16).has_value());
}

}  // namespace
}  // namespace feltside::tests
