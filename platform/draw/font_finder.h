#pragma once

#include <string>

namespace platform {

/// A face in a file of the machine; none where the path is empty.
struct FontFile {
  std::string path;
  int index = 0;  ///< of the face in a file that has several
};

/// Answers which file has a face with a character, and what has none is found out by looking.
using FontFinder = FontFile (*)(char32_t character);

/// Sets who is asked for the characters that the type family lacks; each is asked for once per
/// font. Without a finder there are none.
void SetFontFinder(FontFinder finder);
FontFile FindFontFile(char32_t character);

}  // namespace platform
