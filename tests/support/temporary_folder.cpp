#include "tests/support/temporary_folder.h"

#include <fstream>
#include <random>
#include <sstream>
#include <string>
#include <system_error>

namespace feltside::tests {

namespace fs = std::filesystem;

TemporaryFolder::TemporaryFolder() {
  std::random_device random;
  do {
    m_path = fs::temp_directory_path() / ("feltside-test-" + std::to_string(random()));
  } while (!fs::create_directory(m_path));
}

TemporaryFolder::~TemporaryFolder() {
  std::error_code error;
  fs::remove_all(m_path, error);
}

std::string ReadFile(const fs::path& file) {
  std::ifstream stream(file, std::ios::binary);
  std::ostringstream text;
  text << stream.rdbuf();
  return text.str();
}

void WriteFile(const fs::path& file, const std::string& text) {
  fs::create_directories(file.parent_path());
  std::ofstream(file, std::ios::binary) << text;
}

}  // namespace feltside::tests
