#include "platform/store/profile.h"

#include <toml++/toml.h>

#include <fstream>
#include <functional>
#include <iostream>
#include <limits>
#include <optional>
#include <sstream>
#include <system_error>
#include <utility>

#include "platform/store/atomic_file.h"

namespace platform {
namespace {

namespace fs = std::filesystem;

constexpr int kMostLinks = 20;  ///< more of them run in a circle

/// How a reading of the file ended.
enum class Reading { kRead, kMissing, kUnreadable, kDamaged };

struct ReadProfile {
  Reading reading = Reading::kMissing;
  toml::table values;
};

ReadProfile Read(const fs::path& file) {
  std::error_code error;
  if (!fs::exists(file, error)) return {error ? Reading::kUnreadable : Reading::kMissing, {}};
  if (!fs::is_regular_file(file, error)) return {Reading::kUnreadable, {}};
  std::ifstream stream(file, std::ios::binary);
  std::ostringstream text;
  text << stream.rdbuf();
  // An empty file reads as a failure, too.
  if (!stream || text.bad()) {
    return {fs::file_size(file, error) == 0 ? Reading::kRead : Reading::kUnreadable, {}};
  }
  try {
    return {Reading::kRead, toml::parse(text.str())};
  } catch (const toml::parse_error&) {
    return {Reading::kDamaged, {}};
  }
}

/// A free name beside the file: "name.damaged-1" and so on.
fs::path NameForDamaged(const fs::path& file) {
  std::error_code error;
  fs::path name;
  int number = 1;
  do {
    name = file.string() + ".damaged-" + std::to_string(number++);
  } while (fs::exists(name, error));
  return name;
}

void TellWhereKept(const std::string& what, const fs::path& kept, const std::error_code& error) {
  std::cerr << what << " cannot be understood; ";
  if (error) {
    std::cerr << "the file cannot be kept as " << kept << " (" << error.message() << ").\n";
  } else {
    std::cerr << "the file as it was is kept as " << kept << ".\n";
  }
}

void SetAside(const fs::path& file) {
  const fs::path kept = NameForDamaged(file);
  std::error_code error;
  fs::rename(file, kept, error);
  TellWhereKept("The settings in " + file.string(), kept, error);
}

fs::path LockOf(const fs::path& file) { return file.string() + ".lock"; }

/// Reads under a lock, and sets aside what cannot be understood. A file that another game holds
/// cannot be read.
ReadProfile ReadLocked(const fs::path& file, const CFileLock& lock) {
  if (lock.IsRefused()) return {Reading::kUnreadable, {}};
  ReadProfile profile = Read(file);
  if (profile.reading == Reading::kDamaged) SetAside(file);
  return profile;
}

/// Reads without the lock, as every file that is ever there is a whole one; only a damaged one is
/// looked at again under the lock, since another game may have replaced it meanwhile.
ReadProfile ReadUnlocked(const fs::path& file) {
  ReadProfile profile = Read(file);
  if (profile.reading != Reading::kDamaged) return profile;
  const CFileLock lock(LockOf(file));
  return ReadLocked(file, lock);
}

/// Keeps a copy of a file in which something stands, under this name, that is not what must be
/// written in its place.
void KeepCopy(const fs::path& file, const std::string& name) {
  const fs::path kept = NameForDamaged(file);
  std::error_code error;
  fs::copy_file(file, kept, error);
  TellWhereKept("The value of " + name + " in " + file.string(), kept, error);
}

/// Strings as plain quoted ones: in the other forms some line ends do not come back as they were.
std::string Format(const toml::table& values) {
  std::ostringstream text;
  text << toml::toml_formatter(values, toml::format_flags::allow_unicode_strings) << '\n';
  return text.str();
}

/// Puts a value into a section; what was none of its type is kept in a copy of the file.
template <class Value>
void Put(const fs::path& file, toml::table& values, const std::string& entry, const Value& value) {
  if (values.contains(entry) && !values[entry].template is<Value>()) KeepCopy(file, entry);
  values.insert_or_assign(entry, value);
}

/// Changes a section of the file in one step that no other game comes between; `entry` names on the
/// error stream what could not be kept.
bool Update(const fs::path& file, const std::string& section, const std::string& entry,
            const std::function<void(toml::table&)>& change) {
  if (file.empty()) {
    std::cerr << "The setting " << entry << " cannot be kept, as there is no home to keep it in.\n";
    return false;
  }
  std::error_code error;
  fs::create_directories(file.parent_path(), error);
  const CFileLock lock(LockOf(file));
  ReadProfile profile = ReadLocked(file, lock);
  bool written = false;
  if (profile.reading != Reading::kUnreadable) {
    if (profile.values.contains(section) && !profile.values[section].is_table()) {
      KeepCopy(file, section);
      profile.values.erase(section);
    }
    profile.values.emplace<toml::table>(section);
    change(*profile.values[section].as_table());
    written = ReplaceFile(file, Format(profile.values));
  }
  if (!written) std::cerr << "The setting " << entry << " cannot be kept in " << file << ".\n";
  return written;
}

}  // namespace

CProfile::CProfile(fs::path file) : m_file(std::move(file)) {
  // What a symbolic link leads to is replaced, not the link.
  std::error_code error;
  for (int links = 0; links < kMostLinks && fs::is_symlink(m_file, error); ++links) {
    m_file = m_file.parent_path() / fs::read_symlink(m_file, error);
  }
}

int CProfile::GetInt(const std::string& section, const std::string& entry, int absent) const {
  const ReadProfile profile = ReadUnlocked(m_file);
  const auto value = profile.values[section][entry].value_exact<std::int64_t>();
  const bool fits = value && *value >= std::numeric_limits<int>::min() &&
                    *value <= std::numeric_limits<int>::max();
  return fits ? static_cast<int>(*value) : absent;
}

std::string CProfile::GetString(const std::string& section, const std::string& entry,
                                const std::string& absent) const {
  const ReadProfile profile = ReadUnlocked(m_file);
  return profile.values[section][entry].value_exact<std::string>().value_or(absent);
}

bool CProfile::WriteInt(const std::string& section, const std::string& entry, int value) const {
  return Update(m_file, section, entry, [&](toml::table& values) {
    Put(m_file, values, entry, static_cast<std::int64_t>(value));
  });
}

bool CProfile::UpdateStrings(const std::string& section, const std::vector<std::string>& entries,
                             const StringsRule& rule) const {
  return Update(m_file, section, entries.front(), [&](toml::table& values) {
    std::vector<std::string> strings;
    strings.reserve(entries.size());
    for (const std::string& entry : entries) {
      strings.push_back(values[entry].value_exact<std::string>().value_or(""));
    }
    strings = rule(strings);
    for (std::size_t i = 0; i < strings.size(); ++i) Put(m_file, values, entries[i], strings[i]);
  });
}

}  // namespace platform
