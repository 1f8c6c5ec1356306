#pragma once

#include <filesystem>
#include <string>

namespace feltside::tests {

/// A new, empty folder that goes with this object, whatever was put into it.
class TemporaryFolder {
 public:
  TemporaryFolder();
  ~TemporaryFolder();
  TemporaryFolder(const TemporaryFolder&) = delete;
  TemporaryFolder& operator=(const TemporaryFolder&) = delete;

  const std::filesystem::path& Path() const { return m_path; }

 private:
  std::filesystem::path m_path;
};

/// A whole file, empty where there is none.
std::string ReadFile(const std::filesystem::path& file);
/// Makes the file's folder too.
void WriteFile(const std::filesystem::path& file, const std::string& text);

}  // namespace feltside::tests
