#pragma once

#include <SDL.h>

#include "platform/host/input.h"
#include "platform/host/sdl_window.h"

namespace platform {

/// Makes of SDL's events what the program knows as input. Those that are for the window alone go
/// there.
class SdlEvents {
 public:
  explicit SdlEvents(SdlWindow& window);

  /// Answers whether an event is one for the program.
  bool Translate(const SDL_Event& raw, InputEvent& event);

 private:
  bool OnWindow(const SDL_WindowEvent& window, InputEvent& event);
  bool OnButton(const SDL_MouseButtonEvent& button, InputEvent& event) const;
  bool OnMotion(const SDL_MouseMotionEvent& motion, InputEvent& event) const;
  bool OnWheel(const SDL_MouseWheelEvent& wheel, InputEvent& event) const;
  bool OnKeyDown(const SDL_KeyboardEvent& key, InputEvent& event);
  bool OnText(const char* text, InputEvent& event) const;

  SdlWindow& m_window;
  Uint16 m_nHeld = KMOD_NONE;  ///< which keys were held down beside the last key
};

/// A text that SDL hands over, which may be none.
std::string TakeText(char* text);

}  // namespace platform
