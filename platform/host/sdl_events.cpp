#include "platform/host/sdl_events.h"

#include "platform/host/sdl_keys.h"

namespace platform {
namespace {

/// Whether keys are chords and type nothing; some desktops send a text for them all the same. The
/// right Alt key types letters of its own.
bool IsChord(Uint16 held) {
  return (held & (KMOD_RALT | KMOD_MODE)) == 0 && (held & (KMOD_CTRL | KMOD_LALT)) != 0;
}

bool Composing(const std::string& text, InputEvent& event) {
  event.kind = InputKind::kComposition;
  event.text = text;
  return true;
}

}  // namespace

std::string TakeText(char* text) {
  std::string copy = text == nullptr ? "" : text;
  SDL_free(text);
  return copy;
}

SdlEvents::SdlEvents(SdlWindow& window) : m_window(window) { SDL_StopTextInput(); }

bool SdlEvents::Translate(const SDL_Event& raw, InputEvent& event) {
  event = {};
  switch (raw.type) {
    case SDL_QUIT:
      event.kind = InputKind::kClose;
      return true;
    case SDL_WINDOWEVENT:
      return OnWindow(raw.window, event);
    case SDL_MOUSEBUTTONDOWN:
    case SDL_MOUSEBUTTONUP:
      return OnButton(raw.button, event);
    case SDL_MOUSEMOTION:
      return OnMotion(raw.motion, event);
    case SDL_MOUSEWHEEL:
      return OnWheel(raw.wheel, event);
    case SDL_KEYDOWN:
      m_nHeld = raw.key.keysym.mod;
      return OnKeyDown(raw.key, event);
    case SDL_KEYUP:
      m_nHeld = raw.key.keysym.mod;
      return false;
    case SDL_TEXTINPUT:
      return OnText(raw.text.text, event);
    case SDL_TEXTEDITING:
      return Composing(raw.edit.text, event);
    case SDL_TEXTEDITING_EXT:
      return Composing(TakeText(raw.editExt.text), event);
    default:
      return false;
  }
}

bool SdlEvents::OnWindow(const SDL_WindowEvent& window, InputEvent& event) {
  m_window.OnWindowEvent(window);
  event.kind = InputKind::kPointerLeave;
  return window.event == SDL_WINDOWEVENT_LEAVE;
}

bool SdlEvents::OnButton(const SDL_MouseButtonEvent& button, InputEvent& event) const {
  const bool down = button.type == SDL_MOUSEBUTTONDOWN;
  event.at = m_window.FramePoint({button.x, button.y});
  if (button.button == SDL_BUTTON_MIDDLE && down) {
    event.kind = InputKind::kMiddleClick;
    event.text = TakeText(SDL_GetPrimarySelectionText());
    return true;
  }
  event.kind = down ? InputKind::kPointerDown : InputKind::kPointerUp;
  return button.button == SDL_BUTTON_LEFT;
}

/// A finger that is lifted hovers nowhere.
bool SdlEvents::OnMotion(const SDL_MouseMotionEvent& motion, InputEvent& event) const {
  event.kind = InputKind::kPointerMove;
  event.at = m_window.FramePoint({motion.x, motion.y});
  return motion.which != SDL_TOUCH_MOUSEID || motion.state != 0;
}

bool SdlEvents::OnWheel(const SDL_MouseWheelEvent& wheel, InputEvent& event) const {
  event.kind = InputKind::kWheel;
  event.at = m_window.FramePoint({wheel.mouseX, wheel.mouseY});
  event.wheel = wheel.y;
  return wheel.y != 0;
}

bool SdlEvents::OnKeyDown(const SDL_KeyboardEvent& key, InputEvent& event) {
  if (key.keysym.sym == SDLK_F11) {
    if (key.repeat == 0) m_window.Placement().ToggleFullScreen();
    return false;
  }
  event.kind = InputKind::kKey;
  event.stroke = StrokeOf(key.keysym);
  return event.stroke.key != Key::kNone && (key.repeat == 0 || ActsWhileHeld(event.stroke.key));
}

bool SdlEvents::OnText(const char* text, InputEvent& event) const {
  event.kind = InputKind::kText;
  event.text = text;
  return !IsChord(m_nHeld);
}

}  // namespace platform
