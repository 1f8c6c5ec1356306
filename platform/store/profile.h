#pragma once

#include <filesystem>
#include <functional>
#include <string>
#include <vector>

namespace platform {

/// The store of the player's choices: integers and strings by section and entry, in one file that
/// two running games may share.
///
/// Every call reads the file anew. A missing file, entry or a value of another type reads as the
/// default. A file that cannot be understood is set aside under another name and said on the error
/// stream. A write replaces the file as a whole, so it is either the old one or the new one
/// whatever happens; where it fails, the old file stays and the error stream says so.
class CProfile {
 public:
  /// An empty path keeps nothing: every value is absent.
  explicit CProfile(std::filesystem::path file);

  int GetInt(const std::string& section, const std::string& entry, int absent) const;
  std::string GetString(const std::string& section, const std::string& entry,
                        const std::string& absent) const;
  /// Answers whether the value is on the disk.
  bool WriteInt(const std::string& section, const std::string& entry, int value) const;

  /// Takes the strings of some entries, empty where there is none, and answers what to write from
  /// the first entry on; at most as many.
  using StringsRule = std::function<std::vector<std::string>(const std::vector<std::string>&)>;
  /// Changes several strings in one step: all of them or, when the program dies, none; and no other
  /// game comes between the reading and the writing. Answers whether they are on the disk.
  bool UpdateStrings(const std::string& section, const std::vector<std::string>& entries,
                     const StringsRule& rule) const;

 private:
  std::filesystem::path m_file;
};

}  // namespace platform
