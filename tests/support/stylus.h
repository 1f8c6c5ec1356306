#pragma once

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/draw/bitmap.h"
#include "tests/support/child.h"
#include "tests/support/temporary_folder.h"

namespace feltside::tests {

using Json = nlohmann::json;

// Compiled once, as the library's parser and writer take their time under the sanitizers.
Json ReadJson(const std::string& text);
std::string ToText(const Json& value);

/// The program as a player meets it: feltside-stylus as a process with a profile of its own.
///
/// When it goes, it closes the program's input, and the test fails unless the program then ends
/// with code 0 and without a word from the sanitizers.
class Stylus {
 public:
  /// Starts the program with this text as its settings' file; without one when it is empty.
  explicit Stylus(const std::string& profile = {});
  ~Stylus();
  Stylus(const Stylus&) = delete;
  Stylus& operator=(const Stylus&) = delete;

  /// Gives a command and returns its answer; throws when the program has died.
  Json Send(const std::string& line);

  std::filesystem::path ProfileFile() const;
  /// The whole window.
  platform::CBitmap Shot();
  /// What the program has said on its error stream so far.
  std::string Errors() const;

 private:
  TemporaryFolder m_folder;
  Child m_program{};
};

}  // namespace feltside::tests
