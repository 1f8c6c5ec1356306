#include "platform/draw/bitmap.h"

#include <algorithm>

namespace platform {

CBitmap::CBitmap(Size size, Color fill)
    : m_size{std::max(size.width, 0), std::max(size.height, 0)},
      m_arrPixels(Count(), ToPixel(fill)) {}

CBitmap CBitmap::SeeThrough(Size size) {
  CBitmap bitmap;
  bitmap.m_size = {std::max(size.width, 0), std::max(size.height, 0)};
  bitmap.m_arrPixels.resize(bitmap.Count());
  return bitmap;
}

}  // namespace platform
