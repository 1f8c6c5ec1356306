#include "platform/draw/bitmap.h"

#include <algorithm>

namespace platform {

CBitmap::CBitmap(Size size, Color fill)
    : m_size{std::max(size.width, 0), std::max(size.height, 0)},
      m_arrPixels(static_cast<std::size_t>(m_size.width) * static_cast<std::size_t>(m_size.height),
                  ToPixel(fill)) {}

CBitmap CBitmap::SeeThrough(Size size) {
  CBitmap bitmap(size);
  std::fill(bitmap.m_arrPixels.begin(), bitmap.m_arrPixels.end(), Pixel{0});
  return bitmap;
}

}  // namespace platform
