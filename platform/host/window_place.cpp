#include "platform/host/window_place.h"

#include <algorithm>

namespace platform {
namespace {

int SharedArea(const Rect& a, const Rect& b) {
  const Rect shared = a.Intersection(b);
  return shared.IsEmpty() ? 0 : shared.Width() * shared.Height();
}

/// Where a length may begin so that it lies between two bounds that have room for it.
int Within(int begin, int length, int low, int high) {
  return std::clamp(begin, low, high - length);
}

}  // namespace

Rect MovedOnto(const std::vector<Rect>& displays, const Rect& window) {
  const auto display =
      std::max_element(displays.begin(), displays.end(), [&window](const Rect& a, const Rect& b) {
        return SharedArea(a, window) < SharedArea(b, window);
      });
  if (display == displays.end()) return window;
  const Size size{std::min(window.Width(), display->Width()),
                  std::min(window.Height(), display->Height())};
  return RectAt({Within(window.left, size.width, display->left, display->right),
                 Within(window.top, size.height, display->top, display->bottom)},
                size);
}

}  // namespace platform
