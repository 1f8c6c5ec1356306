// What the drawing calls do at the edges of surfaces and pictures, by single pixels.

#include "platform/draw/surface.h"

#include <gtest/gtest.h>

#include <functional>

#include "platform/draw/resources.h"
#include "tests/support/golden.h"

namespace feltside::tests {
namespace {

using namespace platform;

constexpr Color kGround = Rgb(1, 2, 3);
constexpr Color kInk = Rgb(200, 100, 50);

/// A picture of one letter per pixel: '.' is the ground, 'i' ink, 'w' white, 'b' black.
std::string Letters(const CBitmap& bitmap) {
  std::string text;
  for (int y = 0; y < bitmap.GetSize().height; ++y) {
    for (int x = 0; x < bitmap.GetSize().width; ++x) {
      const Color color = ToColor(bitmap.At({x, y}));
      text += color == kGround ? '.' : color == kInk ? 'i' : color == kWhite ? 'w' : 'b';
    }
    text += ' ';
  }
  return text;
}

TEST(Surface, DrawsInsideItsBoundsAndThePictureOnly) {
  CBitmap source({3, 2}, kInk);  // wii iib
  source.At({0, 0}) = ToPixel(kWhite);
  source.At({2, 1}) = ToPixel(kBlack);
  using Call = std::pair<const char*, std::function<void(CSurface&)>>;
  // clang-format off
  const std::vector<Call> calls = {
      {"..... bbb.. ..... ..... ", [](CSurface& s) { s.Line({0, 1}, {3, 1}); }},
      {"..... .wi.. ..... ..... ", [&](CSurface& s) { s.BitBlt({1, 1}, {2, 1}, source); }},
      {"ib... ..... ..... ..... ", [&](CSurface& s) { s.BitBlt({-1, -1}, {3, 2}, source); }},
      {"....w ....i ..... ..... ", [&](CSurface& s) { s.BitBlt({4, 0}, {9, 9}, source); }},
      {"ib... ..... ..... ..... ", [&](CSurface& s) { s.BitBlt({}, {9, 9}, source, {1, 1}); }},
      {"wwi.. wwi.. iii.. iii.. ", [&](CSurface& s) { s.StretchBlt({0, 0, 3, 4}, source, {0, 0, 2, 2}); }},
      {".wii. .iib. ..... ..... ", [&](CSurface& s) { s.StretchBlt({0, 0, 5, 4}, source, {-1, 0, 4, 4}); }}};
  // clang-format on
  for (const auto& [letters, draw] : calls) {
    CBitmap whole({5, 4}, kGround);
    CSurface surface(whole);
    draw(surface);
    EXPECT_EQ(Letters(whole), letters);
    // The same on a part of a larger bitmap leaves everything around it alone.
    CBitmap larger({9, 9}, kGround);
    CSurface part(larger, {2, 3, 7, 7});
    draw(part);
    CBitmap expected({9, 9}, kGround);
    CSurface(expected).BitBlt({2, 3}, {5, 4}, whole);
    EXPECT_EQ(Letters(larger), Letters(expected));
  }
}

TEST(Bitmap, HasNoPixelsWithoutWidthOrHeight) {
  for (const Size size : {Size{-1, 5}, {0, 5}, {5, 0}, {5, -1}}) {
    EXPECT_TRUE(CBitmap(size).Pixels().empty()) << size.width;
    EXPECT_TRUE(CBitmap::SeeThrough(size).Pixels().empty()) << size.width;
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
