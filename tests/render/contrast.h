#pragma once

#include <string>
#include <vector>

#include "platform/surface.h"
#include "tests/support/stylus.h"

namespace feltside::tests {

// How well a text can be read: its contrast with what it stands on. The measure is the contrast
// ratio of the Web Content Accessibility Guidelines 2.1 (W3C, 2018: "contrast ratio", "relative
// luminance"), which ask for 4.5 : 1.

inline constexpr double kReadable = 4.5;
inline constexpr double kDisabled = 3;    ///< what cannot be used may be fainter, but must be seen
inline constexpr double kOnlyListed = 0;  ///< both colours are fixed: nothing can be asked of them

/// A text that must stand in a window: exactly once, with its top-left corner in a rectangle.
struct Text {
  std::string string;  ///< '&' underlines the letter after it
  platform::Rect corners;
  platform::Font font;
  platform::Color color;
  double bound = kReadable;
};

/// Of two colours, 1 to 21.
double Contrast(platform::Color a, platform::Color b);

/// The corners where every pixel of the text's ink has its colour.
std::vector<platform::Point> PlacesOf(const platform::CBitmap& shot, const Text& text);

/// Fails the test for a text that is not there, or whose ink has too little contrast with a pixel
/// beside it. Empty texts are passed over.
void ExpectReadable(const platform::CBitmap& shot, const std::vector<Text>& texts,
                    const std::string& name);

/// The same for what is drawn in a picture: the contrast between the most frequent colour of a part
/// of the window and that of its frequent colours which is farthest from it.
void ExpectVisible(const platform::CBitmap& shot, const platform::Rect& part, double bound,
                   const std::string& name);

/// Gives the commands, none of which may fail, and returns the state after them.
Json StateAfter(Stylus& stylus, const std::vector<std::string>& commands);

}  // namespace feltside::tests
