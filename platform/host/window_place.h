#pragma once

#include <vector>

#include "platform/draw/geometry.h"

namespace platform {

/// Where a window stands on the desktop.
struct WindowPlace {
  Rect rect;  ///< in the desktop's coordinates, as it is while it is not maximised
  bool maximized = false;

  friend constexpr bool operator==(const WindowPlace&, const WindowPlace&) = default;
};

/// The nearest place for a window that lies wholly on one display: the one that it shares most
/// with, the first one where it shares nothing with any. A window too large for it is cut.
Rect MovedOnto(const std::vector<Rect>& displays, const Rect& window);

}  // namespace platform
