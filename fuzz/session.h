#pragma once

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "tests/support/temporary_folder.h"

namespace feltside::fuzz {

/// A settings' file in a folder of its own, and games that are played on it inside this process,
/// one after another.
class CSession {
 public:
  explicit CSession(const std::string& settings);

  /// Plays the lines from the start of a program to its end, which must be a good one. Its answers.
  std::vector<nlohmann::json> Play(const std::vector<std::string>& lines) const;

  std::string Settings() const { return tests::ReadFile(m_file); }
  /// The texts that were set aside.
  std::vector<std::string> Kept() const;

 private:
  tests::TemporaryFolder m_folder;
  std::filesystem::path m_file = m_folder.Path() / "Quillworks" / "Feltside.toml";
};

}  // namespace feltside::fuzz
