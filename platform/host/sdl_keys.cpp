#include "platform/host/sdl_keys.h"

#include <cctype>
#include <cstddef>

namespace platform {
namespace {

struct KeyPair {
  SDL_Keycode code;
  Key key;
};

constexpr KeyPair kKeys[] = {
    {SDLK_RETURN, Key::kEnter},
    {SDLK_KP_ENTER, Key::kEnter},
    {SDLK_ESCAPE, Key::kEscape},
    {SDLK_TAB, Key::kTab},
    {SDLK_BACKSPACE, Key::kBackspace},
    {SDLK_DELETE, Key::kDelete},
    {SDLK_INSERT, Key::kInsert},
    {SDLK_UP, Key::kUp},
    {SDLK_DOWN, Key::kDown},
    {SDLK_LEFT, Key::kLeft},
    {SDLK_RIGHT, Key::kRight},
    {SDLK_HOME, Key::kHome},
    {SDLK_END, Key::kEnd},
    {SDLK_PAGEUP, Key::kPageUp},
    {SDLK_PAGEDOWN, Key::kPageDown},
    {SDLK_F1, Key::kF1},
    {SDLK_F4, Key::kF4},
    {SDLK_F10, Key::kF10},
};

/// The keypad while it does not type digits.
constexpr KeyPair kKeypad[] = {
    {SDLK_KP_7, Key::kHome},        {SDLK_KP_8, Key::kUp},       {SDLK_KP_9, Key::kPageUp},
    {SDLK_KP_4, Key::kLeft},        {SDLK_KP_6, Key::kRight},    {SDLK_KP_1, Key::kEnd},
    {SDLK_KP_2, Key::kDown},        {SDLK_KP_3, Key::kPageDown}, {SDLK_KP_0, Key::kInsert},
    {SDLK_KP_PERIOD, Key::kDelete},
};

/// The key that a code stands for in a table; kNone where it stands there for none.
template <std::size_t count>
Key KeyIn(const KeyPair (&keys)[count], SDL_Keycode code) {
  for (const KeyPair& pair : keys) {
    if (pair.code == code) return pair.key;
  }
  return Key::kNone;
}

/// What a key types that is no letter of its own on every keyboard: digits, whichever row or layer
/// they lie on, and the signs of addition.
char SignOf(const SDL_Keysym& key) {
  if (key.sym == SDLK_PLUS || key.sym == SDLK_KP_PLUS ||
      (key.sym == SDLK_EQUALS && (key.mod & KMOD_SHIFT) != 0)) {
    return '+';
  }
  if (key.sym == SDLK_MINUS || key.sym == SDLK_KP_MINUS) return '-';
  if (key.sym >= SDLK_KP_1 && key.sym <= SDLK_KP_9) {
    return static_cast<char>('1' + (key.sym - SDLK_KP_1));
  }
  const bool letter = key.sym >= SDLK_a && key.sym <= SDLK_z;
  if (!letter && key.scancode >= SDL_SCANCODE_1 && key.scancode <= SDL_SCANCODE_9) {
    return static_cast<char>('1' + (key.scancode - SDL_SCANCODE_1));
  }
  return 0;
}

char CharacterOf(const SDL_Keysym& key) {
  if (const char sign = SignOf(key); sign != 0) return sign;
  // Where the keyboard types no Latin letters, a key means the letter that lies there elsewhere.
  constexpr SDL_Keycode kLastAscii = 0x7F;
  if (key.sym > kLastAscii && key.scancode >= SDL_SCANCODE_A && key.scancode <= SDL_SCANCODE_Z) {
    return static_cast<char>('A' + (key.scancode - SDL_SCANCODE_A));
  }
  if (key.sym < SDLK_SPACE || key.sym > SDLK_z) return 0;
  return static_cast<char>(std::toupper(static_cast<int>(key.sym)));
}

}  // namespace

KeyStroke StrokeOf(const SDL_Keysym& key) {
  KeyStroke stroke;
  stroke.ctrl = (key.mod & KMOD_CTRL) != 0;
  stroke.alt = (key.mod & KMOD_ALT) != 0;
  stroke.shift = (key.mod & KMOD_SHIFT) != 0;
  stroke.key = KeyIn(kKeys, key.sym);
  if (stroke.key == Key::kNone && (key.mod & KMOD_NUM) == 0) stroke.key = KeyIn(kKeypad, key.sym);
  if (stroke.key != Key::kNone) return stroke;
  stroke.character = CharacterOf(key);
  if (stroke.character != 0) stroke.key = Key::kCharacter;
  return stroke;
}

}  // namespace platform
