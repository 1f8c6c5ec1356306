// Takes a fuzz target through the files of some folders, in place of the fuzzer.

#include <algorithm>
#include <exception>
#include <filesystem>
#include <iostream>
#include <vector>

#include "fuzz/bytes.h"
#include "tests/support/temporary_folder.h"

namespace {

bool Take(const std::string& bytes) {
  try {
    LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
    return true;
  } catch (const std::exception& error) {
    std::cerr << error.what() << '\n';
    return false;
  }
}

}  // namespace

int main(int argc, char** argv) {
  std::vector<std::filesystem::path> files;
  for (int i = 1; i < argc; ++i) {
    for (const auto& entry : std::filesystem::directory_iterator(argv[i])) {
      files.push_back(entry.path());
    }
  }
  std::sort(files.begin(), files.end());
  for (const auto& file : files) {
    std::cout << file.filename().string() << std::endl;  // the last one named is the culprit
    if (!Take(feltside::tests::ReadFile(file))) return 1;
  }
  return files.empty() ? 1 : 0;
}
