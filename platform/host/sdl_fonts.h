#pragma once

#include "platform/draw/font_finder.h"

namespace platform {

/// The desktop's own face for a character, as fontconfig has it; none where the desktop has no
/// fontconfig. The first call takes its time and memory, which are kept.
FontFile FindDesktopFont(char32_t character);

}  // namespace platform
