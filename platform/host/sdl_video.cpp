#include "platform/host/sdl_video.h"

#include <SDL.h>

#include <cstdlib>
#include <string_view>

namespace platform {
namespace {

bool ShowsNothing(std::string_view driver) { return driver == "offscreen" || driver == "dummy"; }

/// Displays of 256 colours, and of 30 bits a pixel, have no pixel format that SDL could draw in.
bool HasUnknownPixels() {
  SDL_DisplayMode mode;
  return SDL_GetDesktopDisplayMode(0, &mode) == 0 && mode.format == SDL_PIXELFORMAT_UNKNOWN;
}

/// What is the matter with the display that the person has, where they have one.
std::string WhyNoDisplay() {
  const char* display = std::getenv("DISPLAY");
  if (display == nullptr || *display == '\0') return "There is no display to show a window on.";
  SDL_VideoInit("x11");
  return std::string("The display ") + display + " cannot show a window: " + SDL_GetError() + ".";
}

}  // namespace

SdlVideo::SdlVideo() {
  // A card game that lies idle is no reason to keep the screen on.
  SDL_SetHint(SDL_HINT_VIDEO_ALLOW_SCREENSAVER, "1");
  // Nor to take the desktop's effects away from all other windows.
  SDL_SetHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
  SDL_SetHint(SDL_HINT_IME_SUPPORT_EXTENDED_TEXT, "1");
  SDL_SetHint(SDL_HINT_IME_SHOW_UI, "1");
  if (SDL_Init(SDL_INIT_VIDEO) != 0) {
    m_strTrouble = std::string("No window can be shown: ") + SDL_GetError() + ".";
  } else if (SDL_GetHint(SDL_HINT_VIDEODRIVER) == nullptr &&
             ShowsNothing(SDL_GetCurrentVideoDriver())) {
    m_strTrouble = WhyNoDisplay();
  } else if (HasUnknownPixels()) {
    m_strTrouble = "The display cannot be drawn on: a pixel must have 16 or 24 bits of colour.";
  }
  // What nobody takes is not to look as if it were taken.
  SDL_EventState(SDL_DROPFILE, SDL_DISABLE);
  SDL_EventState(SDL_DROPTEXT, SDL_DISABLE);
}

SdlVideo::~SdlVideo() { SDL_Quit(); }

}  // namespace platform
