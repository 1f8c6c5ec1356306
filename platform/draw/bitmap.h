#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include "platform/draw/color.h"
#include "platform/draw/geometry.h"

namespace platform {

/// One pixel as 0xAARRGGBB. Alpha is 0 (see-through, in icons) or 255.
using Pixel = std::uint32_t;

constexpr Pixel ToPixel(Color color) {
  return 0xFF000000U | static_cast<Pixel>(RedOf(color)) << 16 |
         static_cast<Pixel>(GreenOf(color)) << 8 | static_cast<Pixel>(BlueOf(color));
}

constexpr Color ToColor(Pixel pixel) {
  return Rgb(static_cast<int>(pixel >> 16 & 0xFF), static_cast<int>(pixel >> 8 & 0xFF),
             static_cast<int>(pixel & 0xFF));
}

constexpr bool IsOpaque(Pixel pixel) { return (pixel >> 24) != 0; }

/// A block of pixels in memory, row by row from the top. Copied by value.
class CBitmap {
 public:
  CBitmap() = default;
  /// A bitmap of one colour; a size below 0 counts as 0.
  explicit CBitmap(Size size, Color fill = kBlack);
  /// A bitmap without a single opaque pixel.
  static CBitmap SeeThrough(Size size);

  Size GetSize() const { return m_size; }
  Rect Bounds() const { return RectAt({}, m_size); }
  /// The pixel at a place that must lie within Bounds().
  Pixel& At(Point p) { return m_arrPixels[Index(p)]; }
  const Pixel& At(Point p) const { return m_arrPixels[Index(p)]; }
  const std::vector<Pixel>& Pixels() const { return m_arrPixels; }
  /// The first pixel, for whoever fills the whole block at once.
  Pixel* Data() { return m_arrPixels.data(); }

  friend bool operator==(const CBitmap&, const CBitmap&) = default;

 private:
  std::size_t Count() const {
    return static_cast<std::size_t>(m_size.width) * static_cast<std::size_t>(m_size.height);
  }
  std::size_t Index(Point p) const {
    return static_cast<std::size_t>(p.y) * static_cast<std::size_t>(m_size.width) +
           static_cast<std::size_t>(p.x);
  }

  Size m_size;
  std::vector<Pixel> m_arrPixels;
};

}  // namespace platform
