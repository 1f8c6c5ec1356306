#include "platform/draw/utf8.h"

namespace platform {
namespace {

unsigned ByteAt(const std::string& text, std::size_t at) {
  return static_cast<unsigned char>(text[at]);
}

bool IsContinuation(unsigned byte) { return (byte & 0xC0) == 0x80; }

constexpr char32_t kNoCharacter = 0xFFFD;

/// A letter of a text: its bytes, and what they mean.
struct Letter {
  std::size_t length = 0;  ///< 0: none that is valid
  char32_t character = kNoCharacter;
};

/// The letter that begins at a place; none where a continuation is stray or missing, for a
/// surrogate, more bytes than needed, or beyond the last code point.
Letter LetterAt(const std::string& text, std::size_t at) {
  const unsigned first = ByteAt(text, at);
  if (first < 0x80) return {1, first};
  const std::size_t length = first >= 0xF0 ? 4 : first >= 0xE0 ? 3 : 2;
  if (first < 0xC2 || first > 0xF4 || at + length > text.size()) return {};
  char32_t character = first & (0x7FU >> length);
  for (std::size_t i = 1; i < length; ++i) {
    const unsigned byte = ByteAt(text, at + i);
    if (!IsContinuation(byte)) return {};
    character = character << 6 | (byte & 0x3F);
  }
  const bool surrogate = character >= 0xD800 && character <= 0xDFFF;
  const bool tooLong = (length == 3 && character < 0x800) || (length == 4 && character < 0x10000);
  return surrogate || tooLong || character > 0x10FFFF ? Letter{} : Letter{length, character};
}

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
  } while (at > 0 && IsContinuation(ByteAt(text, at)));
  return at;
}

std::size_t NextLetter(const std::string& text, std::size_t at) {
  if (at >= text.size()) return text.size();
  do {
    ++at;
  } while (at < text.size() && IsContinuation(ByteAt(text, at)));
  return at;
}

char32_t CharacterAt(const std::string& text, std::size_t at) {
  return LetterAt(text, at).character;
}

std::string OneLine(const std::string& text) {
  std::string line;
  for (std::size_t at = 0; at < text.size();) {
    const auto [length, character] = LetterAt(text, at);
    // A line break of two characters is one break.
    const bool secondOfBreak = text[at] == '\n' && at > 0 && text[at - 1] == '\r';
    if (IsControl(character)) {
      if (!secondOfBreak) line += ' ';
    } else {
      line += text.substr(at, length);
    }
    at += length == 0 ? 1 : length;
  }
  return line;
}

}  // namespace platform
