#pragma once

#include <cstdint>

namespace platform {

/// A colour word: red in bits 0-7, green in bits 8-15, blue in bits 16-23, the rest zero. Settings
/// keep a colour as the integer value of this word.
using Color = std::uint32_t;

/// The colour word of three components 0..255.
constexpr Color Rgb(int red, int green, int blue) {
  return static_cast<Color>((red & 0xFF) | (green & 0xFF) << 8 | (blue & 0xFF) << 16);
}

constexpr int RedOf(Color color) { return static_cast<int>(color & 0xFF); }
constexpr int GreenOf(Color color) { return static_cast<int>(color >> 8 & 0xFF); }
constexpr int BlueOf(Color color) { return static_cast<int>(color >> 16 & 0xFF); }

inline constexpr Color kBlack = Rgb(0, 0, 0);
inline constexpr Color kWhite = Rgb(255, 255, 255);

}  // namespace platform
