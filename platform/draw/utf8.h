#pragma once

#include <cstddef>
#include <string>

namespace platform {

// Places in a text are counted in bytes.

/// Where the letter before a place in a UTF-8 text begins; 0 at the start.
std::size_t PreviousLetter(const std::string& text, std::size_t at);

/// Where the letter after the one at a place begins; the text's size at the end.
std::size_t NextLetter(const std::string& text, std::size_t at);

/// The character of the letter that begins at a place within a text; U+FFFD where no valid one
/// does.
char32_t CharacterAt(const std::string& text, std::size_t at);

/// A text fit for one line: control characters, line breaks among them, become blanks; bytes that
/// are not UTF-8 are left out.
std::string OneLine(const std::string& text);

}  // namespace platform
