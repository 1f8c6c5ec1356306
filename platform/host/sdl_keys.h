#pragma once

#include <SDL.h>

#include "platform/host/input.h"

namespace platform {

/// The layer's name for a key that SDL reports; Key::kNone for one that means nothing to it.
KeyStroke StrokeOf(const SDL_Keysym& key);

/// Whether a key that is held down goes on acting: those that move or erase do, those that would
/// deal or play again and again do not.
bool ActsWhileHeld(Key key);

}  // namespace platform
