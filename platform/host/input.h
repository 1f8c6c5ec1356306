#pragma once

#include <optional>
#include <string>

#include "platform/draw/geometry.h"

namespace platform {

/// A key by what it does. Letters, digits and signs are kCharacter.
enum class Key {
  kNone,
  kCharacter,
  kEnter,
  kEscape,
  kTab,
  kBackspace,
  kDelete,
  kInsert,
  kUp,
  kDown,
  kLeft,
  kRight,
  kHome,
  kEnd,
  kPageUp,
  kPageDown,
  kF1,
  kF4,
  kF10,
};

/// A pressed key with what was held down beside it.
struct KeyStroke {
  Key key = Key::kNone;
  char character = 0;  ///< for kCharacter: 'A'..'Z', '0'..'9', ' ', '+', '-' ...; else 0
  bool ctrl = false;
  bool alt = false;
  bool shift = false;

  friend constexpr bool operator==(const KeyStroke&, const KeyStroke&) = default;
};

/// The key stroke that a text such as "Enter", "Alt+B", "Ctrl+N" or "Shift+Tab" names; nothing
/// where it names none.
std::optional<KeyStroke> ParseChord(const std::string& text);

/// The text that ParseChord takes for a key stroke.
std::string ChordText(const KeyStroke& stroke);

/// Whether a key that is held down goes on acting: those that move or erase do, those that would
/// deal or play again and again do not.
bool ActsWhileHeld(Key key);

enum class InputKind {
  kPointerDown,
  kPointerMove,  ///< while the stylus is down or the mouse hovers
  kPointerUp,
  kPointerLeave,  ///< a hovering mouse is no longer over the window; it has no place
  kMiddleClick,   ///< the mouse's middle button; `text` is what is marked anywhere on the desktop
  kWheel,
  kKey,
  kText,
  kComposition,  ///< `text` is what an input method has not finished yet; empty: it is done with it
  kClose,        ///< the window's close button, or the desktop asking the program to end
};

/// One thing that a person did. Pointer places are pixels of the whole window.
struct InputEvent {
  InputKind kind = InputKind::kKey;
  Point at;
  int wheel = 0;  ///< notches, away from the person is positive
  KeyStroke stroke;
  std::string text;  ///< UTF-8
};

}  // namespace platform
