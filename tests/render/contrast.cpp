#include "tests/render/contrast.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <map>

#include "platform/look.h"

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

CBitmap StencilOf(const Text& text) {
  if (platform::WithoutMnemonic(text.string) == text.string) {
    return RenderText(text.font, text.string);
  }
  CBitmap stencil =
      CBitmap::SeeThrough(MeasureText(text.font, platform::WithoutMnemonic(text.string)));
  platform::CSurface surface(stencil);
  DrawMnemonicText(surface, {}, text.string, platform::kBlack);
  return stencil;
}

template <class Rule>
bool AllOf(const Rect& rect, Rule rule) {
  for (int y = rect.top; y < rect.bottom; ++y) {
    for (int x = rect.left; x < rect.right; ++x) {
      if (!rule(Point{x, y})) return false;
    }
  }
  return true;
}

bool IsInk(const CBitmap& stencil, Point p) {
  return stencil.Bounds().Contains(p) && platform::IsOpaque(stencil.At(p));
}

/// The lowest contrast of the text with a pixel beside its ink.
double ContrastAt(const CBitmap& shot, const Text& text, Point at) {
  const CBitmap stencil = StencilOf(text);
  double lowest = Contrast(platform::kBlack, platform::kWhite);
  AllOf(stencil.Bounds().Shrunk(-1), [&](Point p) {
    const bool apart = AllOf({-1, -1, 2, 2}, [&](Point by) { return !IsInk(stencil, p + by); });
    if (apart || IsInk(stencil, p) || !shot.Bounds().Contains(at + p)) return true;
    lowest = std::min(lowest, Contrast(text.color, platform::ToColor(shot.At(at + p))));
    return true;
  });
  return lowest;
}

void Report(const std::string& name, double contrast, double bound) {
  EXPECT_GE(contrast, bound) << name;
  testing::Test::RecordProperty(name, std::to_string(contrast));
  if (bound == kOnlyListed) std::printf("%s: %.2f : 1\n", name.c_str(), contrast);
}

}  // namespace

double Contrast(Color a, Color b) {
  const auto [dark, bright] = std::minmax({Luminance(a), Luminance(b)});
  return (bright + 0.05) / (dark + 0.05);
}

std::vector<Point> PlacesOf(const CBitmap& shot, const Text& text) {
  const CBitmap stencil = StencilOf(text);
  std::vector<Point> places;
  AllOf(text.corners, [&](Point at) {
    const bool stands = AllOf(stencil.Bounds(), [&](Point p) {
      return !IsInk(stencil, p) ||
             (shot.Bounds().Contains(at + p) && platform::ToColor(shot.At(at + p)) == text.color);
    });
    if (stands) places.push_back(at);
    return true;
  });
  return places;
}

void ExpectReadable(const CBitmap& shot, const std::vector<Text>& texts, const std::string& name) {
  for (const Text& text : texts) {
    if (text.string.empty()) continue;
    const std::vector<Point> places = PlacesOf(shot, text);
    EXPECT_EQ(places.size(), 1U) << name << ", " << text.string;
    if (places.empty()) continue;
    Report(name + ", " + text.string, ContrastAt(shot, text, places[0]), text.bound);
  }
}

void ExpectVisible(const CBitmap& shot, const Rect& part, double bound, const std::string& name) {
  std::map<Color, int> counts;
  AllOf(part, [&](Point p) { return ++counts[platform::ToColor(shot.At(p))] > 0; });
  const auto ground = std::max_element(counts.begin(), counts.end(),
                                       [](auto& a, auto& b) { return a.second < b.second; });
  constexpr int kFewest = 25;  // of so many pixels, one must have a colour for it to be frequent
  double farthest = 1;
  for (const auto& [color, count] : counts) {
    if (count * kFewest < part.Width() * part.Height()) continue;
    farthest = std::max(farthest, Contrast(ground->first, color));
  }
  Report(name, farthest, bound);
}

Json StateAfter(Stylus& stylus, const std::vector<std::string>& commands) {
  for (const std::string& command : commands) {
    const Json answer = stylus.Send(command);
    EXPECT_FALSE(answer.contains("error") || answer.contains("refused")) << command;
  }
  return stylus.Send("state");
}

}  // namespace feltside::tests
