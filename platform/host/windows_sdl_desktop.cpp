// Here SDL knows all that there is to know.

#include "platform/host/sdl_desktop.h"

namespace platform {

bool KnowsFullScreen(SDL_Window*) { return true; }

int BarAbove(SDL_Window* window) {
  int top = 0;
  return SDL_GetWindowBordersSize(window, &top, nullptr, nullptr, nullptr) == 0 ? top : 0;
}

Rect StillThere(SDL_Window*, const Rect& part) { return part; }

void ShowTrouble(const std::string& why) {
  SDL_ShowSimpleMessageBox(SDL_MESSAGEBOX_ERROR, "No window", why.c_str(), nullptr);
}

DesktopPatience::DesktopPatience() = default;

}  // namespace platform
