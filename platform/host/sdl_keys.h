#pragma once

#include <SDL.h>

#include "platform/host/input.h"

namespace platform {

/// The layer's name for a key that SDL reports; Key::kNone for one that means nothing to it.
KeyStroke StrokeOf(const SDL_Keysym& key);

}  // namespace platform
