#include "platform/draw/utf8.h"

#include <utf8cpp/utf8.h>

namespace platform {
namespace {

constexpr char32_t kNoCharacter = 0xFFFD;

/// A byte of a letter other than its first.
bool IsContinuation(char byte) { return (static_cast<unsigned char>(byte) & 0xC0) == 0x80; }

/// The control characters of both ranges, and the separators of lines and paragraphs.
bool IsControl(char32_t character) {
  return character < 0x20 || (character >= 0x7F && character < 0xA0) || character == 0x2028 ||
         character == 0x2029;
}

}  // namespace

std::size_t PreviousLetter(const std::string& text, std::size_t at) {
  if (at == 0) return 0;
  do {
    --at;
  } while (at > 0 && IsContinuation(text[at]));
  return at;
}

std::size_t NextLetter(const std::string& text, std::size_t at) {
  if (at >= text.size()) return text.size();
  do {
    ++at;
  } while (at < text.size() && IsContinuation(text[at]));
  return at;
}

char32_t CharacterAt(const std::string& text, std::size_t at) {
  const char* letter = text.data() + at;
  const char* end = text.data() + NextLetter(text, at);
  return utf8::find_invalid(letter, end) == letter ? kNoCharacter
                                                   : utf8::unchecked::peek_next(letter);
}

std::string OneLine(const std::string& text) {
  std::string line;
  const char* const end = text.data() + text.size();
  for (const char* at = text.data(); at != end;) {
    const char* const invalid = utf8::find_invalid(at, end);
    while (at != invalid) {
      const char* const letter = at;
      const char32_t character = utf8::unchecked::next(at);
      // A line break of two characters is one break.
      const bool secondOfBreak = *letter == '\n' && letter != text.data() && letter[-1] == '\r';
      if (!IsControl(character)) {
        line.append(letter, at);
      } else if (!secondOfBreak) {
        line += ' ';
      }
    }
    if (at != end) ++at;
  }
  return line;
}

}  // namespace platform
