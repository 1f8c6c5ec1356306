#pragma once

#include <cstdint>
#include <cstdio>
#include <filesystem>

namespace feltside::tests {

/// A program that runs beside the test and talks with it.
struct Child {
  std::intptr_t process;
  std::FILE* input;   ///< what it reads
  std::FILE* output;  ///< what it says
};

/// Starts a program that has this folder for its settings, and there a file "errors" for its error
/// stream. Throws where that cannot be.
Child StartChild(const std::filesystem::path& program, const std::filesystem::path& folder);

/// Closes its input and waits for its end; returns its exit code, -1 where it has none.
int EndChild(const Child& child);

}  // namespace feltside::tests
