// The drawing calls themselves, by single pixels.

#include "platform/draw/surface.h"

#include <gtest/gtest.h>

#include "platform/draw/resources.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using namespace platform;

TEST(Text, HasExactCellHeights) {
  for (const int height : {11, 13, 14, 15, 22}) {
    for (const bool bold : {false, true}) {
      const Font font{height, bold};
      EXPECT_EQ(MeasureText(font, ""), (Size{0, height}));
      EXPECT_EQ(RenderText(font, "Player").GetSize(), MeasureText(font, "Player"));
      EXPECT_GE(MeasureText({height, true}, "Player").width, MeasureText(font, "Player").width);
    }
    EXPECT_NE(RenderText({height, true}, "Player"), RenderText({height, false}, "Player"));
  }
}

TEST(Resources, ShowABlankWithItsNumberForAPictureThatIsMissing) {
  CResources none({nullptr, 0});
  CBitmap expected({29, 41});
  CSurface surface(expected);
  surface.Rectangle(surface.Bounds());
  const int width = MeasureText({11, false}, "77").width;
  surface.DrawStencil({(29 - width) / 2, 15}, RenderText({11, false}, "77"), kBlack);
  ExpectSame(none.LoadBitmap(77, {29, 41}), expected, "blank");
  EXPECT_EQ(none.LoadIcon(136, {16, 16}).GetSize(), (Size{16, 16}));
  EXPECT_FALSE(none.LoadIconOfSize(128, 16).has_value());
}

}  // namespace
}  // namespace feltside::tests
