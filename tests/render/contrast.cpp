#include "tests/render/contrast.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <map>

#include "platform/draw/look.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;
using platform::Color;
using platform::Point;
using platform::Rect;

double Luminance(Color color) {
  const auto light = [](int part) {
    const double share = part / 255.0;
    return share <= 0.03928 ? share / 12.92 : std::pow((share + 0.055) / 1.055, 2.4);
  };
  return 0.2126 * light(platform::RedOf(color)) + 0.7152 * light(platform::GreenOf(color)) +
         0.0722 * light(platform::BlueOf(color));
}

double Contrast(Color a, Color b) {
  const auto [dark, bright] = std::minmax({Luminance(a), Luminance(b)});
  return (bright + 0.05) / (dark + 0.05);
}

std::vector<Point> PointsOf(const Rect& rect) {
  std::vector<Point> points;
  for (int y = rect.top; y < rect.bottom; ++y) {
    for (int x = rect.left; x < rect.right; ++x) points.push_back({x, y});
  }
  return points;
}

/// A text's pixels with ink, those beside ink, and the others of its cell.
struct Stencil {
  explicit Stencil(const std::string& text, const platform::Font& font) {
    const std::string plain = platform::WithoutMnemonic(text);
    CBitmap pixels = RenderText(font, plain);
    if (plain != text) {
      platform::CSurface surface(pixels);
      DrawMnemonicText(surface, {}, text, platform::kBlack);
    }
    const auto isInk = [&pixels](Point p) {
      return pixels.Bounds().Contains(p) && platform::IsOpaque(pixels.At(p));
    };
    const auto isNearInk = [&isInk](Point p) {
      for (int i = 0; i < 9; ++i) {
        if (isInk(p + Point{i % 3 - 1, i / 3 - 1})) return true;
      }
      return false;
    };
    for (const Point p : PointsOf(pixels.Bounds().Shrunk(-1))) {
      (isInk(p) ? ink : isNearInk(p) ? beside : apart).push_back(p);
    }
  }
  std::vector<Point> ink, beside, apart;
};

std::vector<Point> PointsIn(const CBitmap& shot, Color color) {
  std::vector<Point> points = PointsOf(shot.Bounds());
  points.erase(std::remove_if(points.begin(), points.end(),
                              [&](Point p) { return platform::ToColor(shot.At(p)) != color; }),
               points.end());
  return points;
}

/// Where all of the ink and little else of the cell has the colour, which these points have: no
/// text is found in an area that is full of its colour.
std::vector<Point> PlacesOf(const CBitmap& shot, const Stencil& stencil, Color color,
                            const std::vector<Point>& colored) {
  std::vector<Point> places;
  const auto others = static_cast<long>(stencil.beside.size() + stencil.apart.size());
  for (const Point first : colored) {
    const Point at = first - stencil.ink.front();
    const auto isColored = [&](Point p) {
      return shot.Bounds().Contains(at + p) && platform::ToColor(shot.At(at + p)) == color;
    };
    if (isColored(stencil.beside.front())) continue;  // amid an area of the colour
    if (!std::all_of(stencil.ink.rbegin(), stencil.ink.rend(), isColored)) continue;
    const std::ptrdiff_t more =
        std::count_if(stencil.beside.begin(), stencil.beside.end(), isColored) +
        std::count_if(stencil.apart.begin(), stencil.apart.end(), isColored);
    if (4 * more <= others) places.push_back(at);
  }
  return places;
}

void Report(const std::string& what, double contrast, double bound) {
  EXPECT_GE(contrast, bound) << what;
  if (bound == kOnlyListed) std::printf("%s: %.2f : 1\n", what.c_str(), contrast);
}

}  // namespace

std::vector<Point> PlacesOf(const CBitmap& shot, const std::string& text, const Style& style) {
  return PlacesOf(shot, Stencil(text, style.font), style.color, PointsIn(shot, style.color));
}

void ExpectReadable(const CBitmap& shot, const std::vector<std::string>& texts,
                    const std::vector<Style>& styles) {
  std::map<std::string, int> found;
  for (const Style& style : styles) {
    const std::vector<Point> colored = PointsIn(shot, style.color);
    for (const std::string& text : texts) {
      if (text.empty()) continue;
      const Stencil stencil(text, style.font);
      for (const Point at : PlacesOf(shot, stencil, style.color, colored)) {
        ++found[text];
        double lowest = 21;
        for (const Point p : stencil.beside) {
          if (!shot.Bounds().Contains(at + p)) continue;
          const Color ground = platform::ToColor(shot.At(at + p));
          if (ground != style.color) lowest = std::min(lowest, Contrast(style.color, ground));
        }
        Report(text, lowest, style.bound);
      }
    }
  }
  for (const std::string& text : texts) EXPECT_TRUE(text.empty() || found[text] > 0) << text;
}

void ExpectVisible(const CBitmap& shot, const Rect& part, double bound) {
  std::map<Color, int> counts;
  for (const Point p : PointsOf(part)) ++counts[platform::ToColor(shot.At(p))];
  const auto ground = std::max_element(counts.begin(), counts.end(),
                                       [](auto& a, auto& b) { return a.second < b.second; });
  constexpr int kFewest = 25;  // of so many pixels, one must have a colour for it to be frequent
  double farthest = 1;
  for (const auto& [color, count] : counts) {
    if (count * kFewest < part.Width() * part.Height()) continue;
    farthest = std::max(farthest, Contrast(ground->first, color));
  }
  Report("at " + std::to_string(part.left) + ", " + std::to_string(part.top), farthest, bound);
}

}  // namespace feltside::tests
