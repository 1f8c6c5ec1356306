#pragma once

#include "platform/draw/geometry.h"

namespace platform {

/// Where a window stands on the desktop.
struct WindowPlace {
  Rect rect;  ///< in the desktop's coordinates, as it is while it is not maximised
  bool maximized = false;

  friend constexpr bool operator==(const WindowPlace&, const WindowPlace&) = default;
};

}  // namespace platform
