#pragma once

#include <string>
#include <vector>

#include "platform/draw/surface.h"

namespace feltside::tests {

// How well a text can be read: its contrast with what it stands on. The measure is the contrast
// ratio of the Web Content Accessibility Guidelines 2.1 (W3C, 2018: "contrast ratio", "relative
// luminance"), which ask for 4.5 : 1.

inline constexpr double kReadable = 4.5;
inline constexpr double kDisabled = 3;    ///< what cannot be used may be fainter, but must be seen
inline constexpr double kOnlyListed = 0;  ///< both colours are fixed: nothing can be asked of them

/// A type and colour in which texts are written somewhere, and the contrast that they must have.
struct Style {
  platform::Font font;
  platform::Color color = platform::kBlack;
  double bound = kReadable;
};

/// The top-left corners of a text wherever it stands in a picture; '&' underlines the letter after
/// it.
std::vector<platform::Point> PlacesOf(const platform::CBitmap& shot, const std::string& text,
                                      const Style& style);

/// Fails the test for a text that stands nowhere in any of the styles, or whose ink has too little
/// contrast with a pixel beside it. Empty texts are passed over.
void ExpectReadable(const platform::CBitmap& shot, const std::vector<std::string>& texts,
                    const std::vector<Style>& styles);

/// The same for what is drawn in a picture: the contrast between the most frequent colour of a part
/// and that of its frequent colours which is farthest from it.
void ExpectVisible(const platform::CBitmap& shot, const platform::Rect& part, double bound);

}  // namespace feltside::tests
