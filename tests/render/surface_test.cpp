// The drawing calls themselves, by single pixels.

#include "platform/surface.h"

#include <gtest/gtest.h>

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

struct Call {
  const char* letters;
  void (*draw)(CSurface& surface);
};

CBitmap Source() {
  CBitmap source({3, 2}, kInk);
  source.At({0, 0}) = ToPixel(kWhite);
  source.At({2, 1}) = ToPixel(kBlack);
  return source;
}

TEST(Surface, DrawsInsideItsBoundsOnly) {
  for (const Call& call : std::vector<Call>{
           {"..... .ii.. .ii.. ..... ",
            [](CSurface& s) {
              s.FillRect({1, 1, 3, 3}, kInk);
            }},
           {"iiiii iiiii iiiii iiiii ",
            [](CSurface& s) {
              s.FillRect({-9, -9, 99, 99}, kInk);
            }},
           {"..... ..... ..... ..... ",
            [](CSurface& s) {
              s.FillRect({3, 3, 3, 9}, kInk);
            }},
           {"..... ..... ..... ..... ",
            [](CSurface& s) {
              s.FillRect({4, 0, 2, 4}, kInk);
            }},
           {"bbbb. bwwb. bbbb. ..... ",
            [](CSurface& s) {
              s.Rectangle({0, 0, 4, 3});
            }},
           {"..... bbb.. ..... ..... ",
            [](CSurface& s) {
              s.Line({0, 1}, {3, 1});
            }},
           {"..b.. ..b.. ..b.. ..... ",
            [](CSurface& s) {
              s.Line({2, -5}, {2, 3});
            }},
           {"..... .wii. .iib. ..... ",
            [](CSurface& s) {
              s.BitBlt({1, 1}, {3, 2}, Source());
            }},
           {"..... .wi.. ..... ..... ",
            [](CSurface& s) {
              s.BitBlt({1, 1}, {2, 1}, Source());
            }},
           {"ib... ..... ..... ..... ",
            [](CSurface& s) {
              s.BitBlt({-1, -1}, {3, 2}, Source());
            }},
           {"....w ....i ..... ..... ",
            [](CSurface& s) {
              s.BitBlt({4, 0}, {9, 9}, Source());
            }},
           {"ib... ..... ..... ..... ",
            [](CSurface& s) {
              s.BitBlt({0, 0}, {2, 1}, Source(), {1, 1});
            }},
           {"wwii. wwii. iiib. iiib. ",  // what is wider than the source is left alone
            [](CSurface& s) {
              s.StretchBlt({0, 0, 2, 2}, Source(), {0, 0, 1, 1});
              s.StretchBlt({2, 0, 4, 2}, Source(), {1, 0, 2, 1});
              s.StretchBlt({0, 2, 3, 4}, Source(), {0, 1, 1, 2});
              s.StretchBlt({3, 2, 4, 4}, Source(), {2, 1, 3, 2});
            }},
           {".wi.. ..b.. ..... ..... ",
            [](CSurface& s) {
              CBitmap icon = Source();
              icon.At({2, 0}) = 0;
              icon.At({0, 1}) = 0;
              icon.At({1, 1}) = ToPixel(kBlack);
              icon.At({2, 1}) = 0;
              s.DrawIcon({1, 0}, icon);
            }},
           {".i... i.... ..... ..... ", [](CSurface& s) {
              CBitmap stencil = CBitmap::SeeThrough({2, 2});
              stencil.At({1, 0}) = stencil.At({0, 1}) = ToPixel(kBlack);
              s.DrawStencil({0, 0}, stencil, kInk);
            }}}) {
    CBitmap whole({5, 4}, kGround);
    CSurface surface(whole);
    call.draw(surface);
    EXPECT_EQ(Letters(whole), call.letters);
    // The same on a part of a larger bitmap leaves everything around it alone.
    CBitmap larger({9, 9}, kGround);
    CSurface part(larger, {2, 3, 7, 7});
    call.draw(part);
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

/// The smallest rectangle around the pixels of a colour.
Rect Around(const CBitmap& bitmap, Color color) {
  Rect around{999, 999, 0, 0};
  for (int y = 0; y < bitmap.GetSize().height; ++y) {
    for (int x = 0; x < bitmap.GetSize().width; ++x) {
      if (ToColor(bitmap.At({x, y})) != color) continue;
      around = {std::min(around.left, x), std::min(around.top, y), std::max(around.right, x + 1),
                std::max(around.bottom, y + 1)};
    }
  }
  return around;
}

TEST(Surface, StandsTextOnACellInOpaqueModeOnly) {
  CBitmap bitmap({80, 40}, kGround);
  CSurface surface(bitmap);
  surface.SetTextColor(kInk);
  surface.SetBackColor(kWhite);
  surface.SetFont({15, true});
  surface.TextOut({10, 9}, "Deal");
  const Size extent = surface.TextExtent("Deal");
  EXPECT_EQ(Around(bitmap, kWhite), RectAt({10, 9}, extent));
  const Rect ink = Around(bitmap, kInk);
  EXPECT_EQ(ink.Common(RectAt({10, 9}, extent)), ink);
  EXPECT_GT(ink.Width(), extent.width - 4);

  surface.SetBackMode(BackMode::kTransparent);
  surface.FillRect(surface.Bounds(), kGround);
  surface.TextOut({10, 9}, "Deal");
  EXPECT_EQ(Around(bitmap, kInk), ink);
  EXPECT_EQ(Around(bitmap, kWhite), (Rect{999, 999, 0, 0}));
}

TEST(Surface, AlignsTextAndClipsItToItsRectangle) {
  CBitmap bitmap({120, 30}, kGround);
  CSurface surface(bitmap);
  surface.SetTextColor(kInk);
  const int width = surface.TextExtent("HH").width;
  const Rect place{20, 5, 100, 19};
  const auto left = [&](TextAlign align) {
    surface.FillRect(surface.Bounds(), kGround);
    surface.DrawText(place, "HH", align);
    return Around(bitmap, kWhite).left;
  };
  EXPECT_EQ(left(TextAlign::kLeft), 20);
  EXPECT_EQ(left(TextAlign::kRight), 100 - width);
  EXPECT_EQ(left(TextAlign::kCenter), 20 + (80 - width) / 2);
  surface.FillRect(surface.Bounds(), kGround);
  surface.DrawText({20, 5, 50, 12}, "HHHHHHHHHHHHHHHH", TextAlign::kRight);
  EXPECT_EQ(Around(bitmap, kWhite).Common({20, 5, 50, 12}), Around(bitmap, kWhite));
}

TEST(Text, HasExactCellHeights) {
  for (const int height : {11, 13, 14, 15, 22}) {
    for (const bool bold : {false, true}) {
      const Font font{height, bold};
      EXPECT_EQ(MeasureText(font, "Player").height, height);
      EXPECT_EQ(MeasureText(font, ""), (Size{0, height}));
      EXPECT_EQ(RenderText(font, "Player").GetSize(), MeasureText(font, "Player"));
      EXPECT_GE(MeasureText({height, true}, "Player").width, MeasureText(font, "Player").width);
    }
    EXPECT_NE(RenderText({height, true}, "Player"), RenderText({height, false}, "Player"));
  }
}

}  // namespace
}  // namespace feltside::tests
