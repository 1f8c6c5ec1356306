// Where everything stands and what a tap there hits, for client areas of different sizes.

#include <gtest/gtest.h>

#include <array>
#include <utility>

#include "render/table_layout.h"
#include "shell/res/pictures.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using platform::Point;
using platform::Rect;

struct Area {
  Rect client;
  std::array<Point, 9> first;  ///< the corner of slot 0 of each position
  std::array<Rect, 6> targets;
};

/// Strategy button, insurance yes and no, stake down and up, deal button.
constexpr std::array kHitTests = {&CTableLayout::HitStrategyButton, &CTableLayout::HitInsuranceYes,
                                  &CTableLayout::HitInsuranceNo,    &CTableLayout::HitBetDown,
                                  &CTableLayout::HitBetUp,          &CTableLayout::HitDealButton};

/// From the first slot of each position to the fifth.
constexpr std::array<Point, 9> kToFifth = {
    {{132, 0}, {36, 0}, {36, 0}, {0, 52}, {0, 52}, {36, 0}, {36, 0}, {36, 0}, {36, 0}}};

// clang-format off
const std::vector<Area> kAreas = {
    {{0, 0, 240, 268},
     {{{40, 114}, {79, 217}, {79, 10}, {10, 75}, {201, 75}, {19, 217}, {139, 217}, {19, 10},
       {139, 10}}},
     {{{168, 107, 192, 129}, {56, 190, 129, 207}, {130, 190, 203, 207}, {85, 156, 102, 176},
       {99, 156, 119, 176}, {90, 165, 150, 205}}}},
    {{0, 0, 320, 241},
     {{{80, 100}, {119, 190}, {119, 10}, {10, 61}, {281, 61}, {39, 190}, {199, 190}, {39, 10},
       {199, 10}}},
     {{{208, 93, 232, 115}, {96, 163, 169, 180}, {170, 163, 243, 180}, {125, 142, 142, 162},
       {139, 142, 159, 162}, {130, 151, 190, 191}}}},
    {{6, 4, 207, 299},
     {{{26, 131}, {65, 248}, {65, 10}, {10, 92}, {168, 92}, {12, 248}, {118, 248}, {12, 10},
       {118, 10}}},
     {{{154, 124, 178, 146}, {42, 221, 115, 238}, {116, 221, 189, 238}, {71, 173, 88, 193},
       {85, 173, 105, 193}, {76, 182, 136, 222}}}}};
// clang-format on

class TableLayoutTest : public testing::TestWithParam<Area> {
 protected:
  TableLayoutTest() {
    m_layout.m_nRowCards = 5;
    m_layout.Prepare(m_surface, GetParam().client);
  }

  platform::CBitmap m_nothing;
  platform::CSurface m_surface{m_nothing};
  platform::CResources m_pictures{PictureFiles()};
  CTableLayout m_layout{m_pictures};
};

TEST_P(TableLayoutTest, PlacesCards) {
  for (std::size_t position = 0; position < 9; ++position) {
    const Point first = GetParam().first[position];
    const Point fifth = first + kToFifth[position];
    for (const auto& [slot, corner] : {std::pair{0, first}, {4, fifth}}) {
      Point p;
      m_layout.GetCardPos(p.x, p.y, static_cast<int>(position), slot);
      EXPECT_EQ(p, corner) << position << ", " << slot;
    }
    EXPECT_EQ(m_layout.GetPosRect(static_cast<int>(position)),
              (Rect{first.x, first.y, fifth.x + 29, fifth.y + 41}));
  }
  for (const int position : {-1, 9, 12, 13, 100}) {
    Point p{-7, -8};
    m_layout.GetCardPos(p.x, p.y, position, 0);
    EXPECT_EQ(p, (Point{-7, -8}));
  }
}

TEST_P(TableLayoutTest, HitsEachTargetOnItsPixelsOnly) {
  for (std::size_t i = 0; i < kHitTests.size(); ++i) {
    const Rect rect = GetParam().targets[i];
    const Rect around = rect.Shrunk(-2);
    for (int y = around.top; y < around.bottom; ++y) {
      for (int x = around.left; x < around.right; ++x) {
        ASSERT_EQ((m_layout.*kHitTests[i])({x, y}), rect.Contains({x, y}) ? 1 : 0)
            << i << ": " << x << ", " << y;
      }
    }
  }
}

TEST_P(TableLayoutTest, FindsTheCardUnderAPoint) {
  const Point first = GetParam().first[POS_MIDDLE_ROW];
  for (int y = first.y - 2; y < first.y + 43; ++y) {
    for (int x = first.x - 2; x < first.x + 165; ++x) {
      // Cards stand 33 pixels apart; the outermost column on either side does not count.
      const int across = (x - first.x) % 33;
      const bool onCard =
          y >= first.y && y < first.y + 41 && x > first.x && across >= 1 && across <= 28;
      ASSERT_EQ(m_layout.HitTestCard({x, y}), onCard ? (x - first.x) / 33 : -1) << x << ", " << y;
    }
  }
}

/// Everything that is placed by the client area, on a sheet of its size.
TEST_P(TableLayoutTest, DrawsInAnyClientArea) {
  const Rect client = GetParam().client;
  platform::CBitmap sheet({client.right, client.bottom}, platform::Rgb(0, 155, 0));
  platform::CSurface surface(sheet);
  CTableLayout layout = m_layout;
  layout.Prepare(surface, client);
  layout.DrawPayTable();
  layout.DrawPlayButton(true);
  layout.DrawPlayerBox(5, 100, false);
  layout.DrawVerdictLamp(true);
  layout.DrawAdvice("Hit");
  layout.DrawStrategyButton();
  layout.DrawInsuranceButtons();
  for (const int position : {POS_BOTTOM, POS_TOP}) {
    layout.DrawLabel(position, "Name");
    layout.DrawHandText(position, "21", true);
  }
  layout.DrawAmount(POS_BOTTOM, 7);
  layout.DrawHandText(POS_ABOVE_BOTTOM, "Push!", false);
  layout.DrawActiveMarker(POS_BOTTOM_LEFT);
  // None of these is a card or a place for one.
  for (const int number : {-1, 0, 66}) layout.DrawCard(POS_BOTTOM, 1, number);
  layout.DrawCard(-1, 1, 27);
  layout.DrawCard(POS_BOTTOM, -1, 27);
  layout.DrawCard(POS_BOTTOM, 4, 65);
  ExpectGolden(sheet, "layout_" + std::to_string(client.right));
}

TEST(TableLayout, HasNothingToHitBeforeItIsPrepared) {
  platform::CResources none({nullptr, 0});
  CTableLayout layout(none);
  layout.m_nRowCards = 5;
  for (int y = -99; y < 99; ++y) {
    for (int x = -99; x < 99; ++x) {
      for (const auto hitTest : kHitTests) ASSERT_EQ((layout.*hitTest)({x, y}), 0);
      ASSERT_EQ(layout.HitTestCard({x, y}), -1);
    }
  }
}

INSTANTIATE_TEST_SUITE_P(Areas, TableLayoutTest, testing::ValuesIn(kAreas));

}  // namespace
}  // namespace feltside::tests
