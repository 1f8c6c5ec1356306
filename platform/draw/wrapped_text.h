#pragma once

#include <string>
#include <vector>

#include "platform/draw/surface.h"

namespace platform {

/// A text in lines of system type no wider than so many pixels, broken at blanks; a word that is
/// wider still, such as a path, is broken behind a slash or, without one, at a letter. Mnemonic
/// signs stay and count for nothing; an empty text is one line.
std::vector<std::string> WrapText(const std::string& text, int width);

/// A text that fits so many pixels of system type: itself, or cut at a letter, with an ellipsis in
/// place of what is missing before its last word. The ellipsis stays even where there is no room.
std::string Ellipsized(const std::string& text, int width);

}  // namespace platform
