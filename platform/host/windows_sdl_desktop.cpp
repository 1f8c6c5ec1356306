// Here SDL knows all that there is to know.

#include "platform/host/sdl_desktop.h"

namespace platform {

bool KnowsFullScreen(SDL_Window*) { return true; }

Rect StillThere(SDL_Window*, const Rect& part) { return part; }

DesktopPatience::DesktopPatience() = default;

}  // namespace platform
