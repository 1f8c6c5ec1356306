// The drawing calls themselves, by single pixels.

#include "platform/draw/surface.h"

#include <gtest/gtest.h>

#include "platform/draw/resources.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using namespace platform;

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
