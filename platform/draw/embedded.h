#pragma once

#include <cstddef>
#include <string_view>

namespace platform {

/// A file that was built into the program. The bytes live as long as the process.
struct EmbeddedFile {
  std::string_view name;
  const unsigned char* data;
  std::size_t size;
};

/// A list of built-in files.
struct EmbeddedFiles {
  const EmbeddedFile* first;
  std::size_t count;

  const EmbeddedFile* begin() const { return first; }
  const EmbeddedFile* end() const { return first + count; }
};

/// The faces of the layer's type family.
EmbeddedFiles FontFiles();

/// The file of that name, or null.
inline const EmbeddedFile* FindEmbedded(EmbeddedFiles files, std::string_view name) {
  for (const EmbeddedFile& file : files) {
    if (file.name == name) return &file;
  }
  return nullptr;
}

}  // namespace platform
