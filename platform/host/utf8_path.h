#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace platform {

// Paths as text in UTF-8. What the standard library makes of plain text knows only the letters of
// the machine's own code page, where it has such a thing.

inline std::string ToUtf8(const std::filesystem::path& path) {
  const std::u8string text = path.u8string();
  return {text.begin(), text.end()};
}

inline std::filesystem::path FromUtf8(std::string_view text) {
  return std::u8string(text.begin(), text.end());
}

}  // namespace platform
