// The drawing calls themselves, by single pixels.

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

/// A picture of one letter per pixel: '.' is the ground, 'i' ink, 'w' white, 'b' black, '?' else.
std::string Letters(const CBitmap& bitmap) {
  std::string text;
  for (int y = 0; y < bitmap.GetSize().height; ++y) {
    for (int x = 0; x < bitmap.GetSize().width; ++x) {
      const Color color = ToColor(bitmap.At({x, y}));
      text += color == kGround  ? '.'
              : color == kInk   ? 'i'
              : color == kWhite ? 'w'
              : color == kBlack ? 'b'
                                : '?';
    }
    text += ' ';
  }
  return text;
}

/// "wii iib ", with see-through pixels where `hidden` says so.
CBitmap Source(const std::vector<Point>& hidden = {}) {
  CBitmap source({3, 2}, kInk);
  source.At({0, 0}) = ToPixel(kWhite);
  source.At({2, 1}) = ToPixel(kBlack);
  for (const Point p : hidden) source.At(p) = 0;
  return source;
}

TEST(Surface, DrawsInsideItsBoundsOnly) {
  using Call = std::pair<const char*, std::function<void(CSurface&)>>;
  // clang-format off
  const std::vector<Call> calls = {
      {"..... .ii.. .ii.. ..... ", [](CSurface& s) { s.FillRect({1, 1, 3, 3}, kInk); }},
      {"iiiii iiiii iiiii iiiii ", [](CSurface& s) { s.FillRect({-9, -9, 99, 99}, kInk); }},
      {"..... ..... ..... ..... ", [](CSurface& s) { s.FillRect({4, 0, 2, 4}, kInk); }},
      {"bbbb. bwwb. bbbb. ..... ", [](CSurface& s) { s.Rectangle({0, 0, 4, 3}); }},
      {"..... bbb.. ..... ..... ", [](CSurface& s) { s.Line({0, 1}, {3, 1}); }},
      {"..b.. ..b.. ..b.. ..... ", [](CSurface& s) { s.Line({2, -5}, {2, 3}); }},
      {"..... .wii. .iib. ..... ", [](CSurface& s) { s.BitBlt({1, 1}, {3, 2}, Source()); }},
      {"..... .wi.. ..... ..... ", [](CSurface& s) { s.BitBlt({1, 1}, {2, 1}, Source()); }},
      {"ib... ..... ..... ..... ", [](CSurface& s) { s.BitBlt({-1, -1}, {3, 2}, Source()); }},
      {"....w ....i ..... ..... ", [](CSurface& s) { s.BitBlt({4, 0}, {9, 9}, Source()); }},
      {"ib... ..... ..... ..... ", [](CSurface& s) { s.BitBlt({}, {2, 1}, Source(), {1, 1}); }},
      {"wwi.. wwi.. iii.. iii.. ", [](CSurface& s) { s.StretchBlt({0, 0, 3, 4}, Source(), {0, 0, 2, 2}); }},
      {".wi.. ..ib. ..... ..... ", [](CSurface& s) { s.DrawIcon({1, 0}, Source({{2, 0}, {0, 1}})); }},
      {".ii.. i.i.. ..... ..... ", [](CSurface& s) { s.DrawStencil({}, Source({{0, 0}, {1, 1}}), kInk); }}};
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

TEST(Surface, KeepsWhatIsCommonToPictureAndGround) {
  CBitmap bitmap({3, 1}, Rgb(0xF0, 0x0F, 0x3C));
  CBitmap mask({3, 1}, kWhite);
  mask.At({1, 0}) = ToPixel(Rgb(0xFF, 0, 0));
  mask.At({2, 0}) = ToPixel(Rgb(0xCC, 0xCC, 0xCC));
  CSurface(bitmap).BitBlt({0, 0}, {3, 1}, mask, {}, RasterOp::kAnd);
  EXPECT_EQ(ToColor(bitmap.At({0, 0})), Rgb(0xF0, 0x0F, 0x3C));
  EXPECT_EQ(ToColor(bitmap.At({1, 0})), Rgb(0xF0, 0, 0));
  EXPECT_EQ(ToColor(bitmap.At({2, 0})), Rgb(0xC0, 0x0C, 0x0C));
}

TEST(Surface, ClipsTextToItsRectangleAndGivesItACell) {
  CBitmap bitmap({60, 20}, kGround);
  CSurface surface(bitmap);
  surface.SetTextColor(kInk);
  surface.DrawText({20, 5, 40, 12}, "HHHHHHHHHHHHHHHH", TextAlign::kRight);
  for (int y = 0; y < 20; ++y) {
    for (int x = 0; x < 60; ++x) {
      const bool inside = Rect{20, 5, 40, 12}.Contains({x, y});
      ASSERT_EQ(ToColor(bitmap.At({x, y})) == kGround, !inside) << x << ", " << y;
    }
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
