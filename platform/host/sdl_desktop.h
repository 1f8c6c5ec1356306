#pragma once

#include <SDL.h>

#include <optional>
#include <string>

#include "platform/draw/geometry.h"
#include "platform/host/sdl_library.h"

namespace platform {

// What SDL does not know of the desktop that a window stands on, and only the desktop's own library
// tells.

/// Whether it can show a window on the full screen when it is asked to. On X11 that takes a window
/// manager that says so; without one SDL would believe in a full screen that is not there.
bool KnowsFullScreen(SDL_Window* window);

/// The rows of the bar above a window where the desktop tells places without it; else 0.
int BarAbove(SDL_Window* window);

/// What of a part of the desktop is there now. SDL keeps the sizes of the displays that it has seen
/// at first.
Rect StillThere(SDL_Window* window, const Rect& part);

/// Shows why there is no window, where no terminal would.
void ShowTrouble(const std::string& why);

/// Has the desktop put up with words about a window that has gone: SDL wakes itself up through its
/// window by a connection of its own, which is late at times, and X would end the program for it.
/// Made before SDL's video begins, gone after it has ended.
class DesktopPatience {
 public:
  DesktopPatience();

 private:
  std::optional<SdlLibrary> m_library;  ///< the desktop's
};

}  // namespace platform
