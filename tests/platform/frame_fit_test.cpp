// Where a picture stands in rooms of other sizes, and which of its pixels is meant where.

#include "platform/host/frame_fit.h"

#include <gtest/gtest.h>

#include "platform/host/window_place.h"

namespace feltside::tests {
namespace {

using platform::FrameFit;
using platform::Point;
using platform::Rect;
using platform::Size;

constexpr Size kFrame{240, 294};

TEST(FrameFitTest, FillsTheRoomUnlessAWholeMultipleNearlyDoes) {
  struct Case {
    Size room;
    Rect place;
  };
  const Case cases[] = {
      {{240, 294}, {0, 0, 240, 294}},        // once
      {{800, 600}, {160, 6, 640, 594}},      // twice leaves 12 rows
      {{1366, 768}, {369, 0, 996, 768}},     // twice would leave 180
      {{1920, 1080}, {519, 0, 1401, 1080}},  // three times would leave 198
      {{800, 990}, {40, 54, 760, 936}},      // three times takes nine tenths
      {{801, 990}, {0, 4, 801, 985}},        // and here a little less
      {{390, 844}, {0, 183, 390, 661}},      // as wide as a telephone
      {{200, 200}, {18, 0, 181, 200}},       // smaller than the picture
      {{1, 1}, {0, 0, 1, 1}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(FrameFit(kFrame, c.room).Place(), c.place) << c.room.width << "x" << c.room.height;
  }
}

TEST(FrameFitTest, FindsEveryPixelWhereItIsSeen) {
  for (int step = 0; step < 20; ++step) {
    const Size room{240 + 37 * step, 294 + 23 * step};
    const FrameFit fit(kFrame, room);
    const Point beside = fit.FramePoint(fit.Place().TopLeft() - Point{1, 1});
    EXPECT_TRUE(beside.x == -1 && beside.y == -1) << beside.x << " " << beside.y;
    for (int i = 0; i < kFrame.height; ++i) {
      const Point p{i % kFrame.width, i};
      const Rect seen = fit.RoomRect(RectAt(p, {1, 1}));
      ASSERT_FALSE(seen.IsEmpty());
      EXPECT_EQ(fit.FramePoint(seen.TopLeft()), p) << room.width << " " << p.x << " " << p.y;
      EXPECT_EQ(fit.FramePoint({seen.right - 1, seen.bottom - 1}), p) << room.width << " " << p.y;
    }
  }
}

TEST(WindowPlaceTest, NeverOpensOffTheDesktop) {
  const std::vector<Rect> displays = {{0, 30, 1000, 800}, {1000, 0, 3000, 1200}};
  struct Case {
    Rect window;
    Rect moved;
  };
  const Case cases[] = {
      {{100, 100, 400, 500}, {100, 100, 400, 500}},
      {{100, 0, 400, 400}, {100, 30, 400, 430}},            // under the panel
      {{900, 700, 1300, 1100}, {1000, 700, 1400, 1100}},    // mostly on the second
      {{-500, 5000, -100, 5400}, {0, 400, 400, 800}},       // on neither
      {{1200, -100, 5200, 5000}, {1000, 0, 3000, 1200}},    // larger than any
      {{2900, 1100, 3300, 1500}, {2600, 800, 3000, 1200}},  // a corner in sight
  };
  for (const Case& c : cases) {
    EXPECT_EQ(MovedOnto(displays, c.window), c.moved) << c.window.left << " " << c.window.top;
  }
  EXPECT_EQ(MovedOnto({}, displays[0]), displays[0]);
}

}  // namespace
}  // namespace feltside::tests
