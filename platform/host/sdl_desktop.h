#pragma once

#include <SDL.h>

namespace platform {

/// Whether the desktop can show a window on the full screen when it is asked to. On X11 that takes
/// a window manager that says so; without one SDL would believe in a full screen that is not there.
bool KnowsFullScreen(SDL_Window* window);

}  // namespace platform
