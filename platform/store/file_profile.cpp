// The profile as a file. One that can be read at all is a whole one, as every change replaces it as
// a whole.

#include <array>
#include <cerrno>
#include <fstream>
#include <iostream>
#include <new>
#include <optional>
#include <system_error>
#include <utility>

#include "platform/host/utf8_path.h"
#include "platform/store/atomic_file.h"
#include "platform/store/profile.h"
#include "platform/store/toml_text.h"

namespace platform {
namespace {

namespace fs = std::filesystem;

constexpr int kMostLinks = 20;                        ///< more of them run in a circle
constexpr std::size_t kLargestFile = 1 << 20;         ///< bytes; a larger one is none of ours
constexpr std::chrono::milliseconds kPatience{1000};  ///< with a game that does not let go
constexpr char kNoMemory[] = "there is no memory left";
constexpr char kNoHome[] = "There is no home folder to keep the settings in.";

/// What the file holds, or why that cannot be said.
struct Contents {
  std::string refusal;  ///< why it cannot be read; empty: it can, or there is none
  std::string text;
  std::optional<CProfileSections> sections;  ///< nothing: the text cannot be understood
};

std::string Reason(const std::error_code& error) {
  if (!error) return {};
  if (error == std::errc::operation_would_block) return "another running game holds it";
  if (error == std::errc::device_or_resource_busy) return "another program has it open";
  return error.message();
}

Contents Refused(const std::error_code& error) { return {Reason(error), "", CProfileSections()}; }

/// Reads the whole of a file, or more than is to be read of any.
std::error_code ReadText(const fs::path& file, std::string& text) {
  std::array<char, 4096> piece{};
  errno = 0;
  std::ifstream stream(file, std::ios::binary);
  while (stream && text.size() <= kLargestFile) {
    stream.read(piece.data(), piece.size());
    text.append(piece.data(), static_cast<std::size_t>(stream.gcount()));
  }
  if (!stream.bad() && (stream || stream.eof())) return {};
  return {errno == 0 ? EIO : errno, std::generic_category()};
}

Contents ReadContents(const fs::path& file) {
  std::error_code error;
  const fs::file_status status = fs::status(file, error);
  if (fs::is_other(status)) return Refused(make_error_code(std::errc::not_supported));
  Contents contents;
  std::chrono::milliseconds left = kPatienceWithPrograms;
  do {
    contents.text.clear();
    error = ReadText(file, contents.text);
  } while (MayPass(error, left));
  const bool missing =
      error == std::errc::no_such_file_or_directory || error == std::errc::not_a_directory;
  if (error && !missing) return Refused(error);
  if (contents.text.size() <= kLargestFile) contents.sections = ReadSections(contents.text);
  return contents;
}

fs::path LockOf(const fs::path& file) { return fs::path(file) += ".lock"; }

/// A free name beside the file: "name.damaged-1" and so on; of no use where it cannot be told
/// whether it is free.
fs::path NameForDamaged(const fs::path& file, std::error_code& error) {
  fs::path name;
  int number = 1;
  do {
    name = fs::path(file) += ".damaged-" + std::to_string(number++);
  } while (fs::exists(name, error));
  return name;
}

/// What a symbolic link leads to is replaced, not the link. The standard library knows of none on
/// Windows.
fs::path TargetOf(fs::path file) {
  std::error_code error;
  for (int links = 0; links < kMostLinks && fs::is_symlink(file, error); ++links) {
    file = file.parent_path() / fs::read_symlink(file, error);
  }
  return file;
}

/// Which values are lost, for whoever looks into it; the player is told why.
void ListLost(const CProfileSection& section) {
  std::cerr << "Not stored:";
  for (const auto& [entry, value] : section.Changes()) std::cerr << ' ' << entry;
  std::cerr << '\n';
}

class CFileProfile : public CProfile {
 public:
  explicit CFileProfile(const fs::path& file) : m_file(TargetOf(file)) {}

  std::optional<CProfileSections> Read() override;
  bool Update(const std::string& section, const Change& change) override;

 private:
  Contents ReadUnlocked();
  Contents ReadLocked(const CFileLock& lock);
  // Each returns why it cannot be done; nothing, when it is done.
  std::string SetAside();
  std::string KeepCopy(const std::string& text, const std::string& name);
  std::string Store(const std::string& section, const Change& change);
  std::string Named() const { return "The settings' file " + ToUtf8(m_file); }

  fs::path m_file;
};

std::optional<CProfileSections> CFileProfile::Read() {
  if (m_file.empty()) {
    Tell(kNoHome);
    return {};
  }
  std::string refusal;
  try {
    Contents contents = ReadUnlocked();
    if (contents.refusal.empty()) return contents.sections;
    refusal = contents.refusal;
  } catch (const std::bad_alloc&) {
    refusal = kNoMemory;
  }
  Tell(Named() + " cannot be read: " + refusal + ". The defaults hold.");
  return std::nullopt;
}

bool CFileProfile::Update(const std::string& section, const Change& change) {
  if (m_file.empty()) {
    Tell(kNoHome);
    return false;
  }
  std::string refusal;
  try {
    refusal = Store(section, change);
  } catch (const std::bad_alloc&) {
    refusal = kNoMemory;
  }
  if (refusal.empty()) {
    ForgetTold();
  } else {
    Tell(Named() + " cannot be written: " + refusal + ".");
  }
  return refusal.empty();
}

/// Reads without the lock; only a damaged file is looked at again under it, since another game may
/// have replaced it meanwhile.
Contents CFileProfile::ReadUnlocked() {
  Contents contents = ReadContents(m_file);
  if (contents.sections) return contents;
  const CFileLock lock(LockOf(m_file), kPatience);
  return ReadLocked(lock);
}

/// Reads under a lock, and sets aside what cannot be understood. A file that another game holds
/// cannot be read.
Contents CFileProfile::ReadLocked(const CFileLock& lock) {
  if (lock.Error()) return Refused(lock.Error());
  Contents contents = ReadContents(m_file);
  if (contents.sections) return contents;
  return {SetAside(), "", CProfileSections()};
}

std::string CFileProfile::SetAside() {
  std::error_code error;
  const fs::path kept = NameForDamaged(m_file, error);
  if (!error) fs::rename(m_file, kept, error);
  if (error) {
    return "it cannot be understood, and not be kept under another name (" + Reason(error) + ")";
  }
  Tell(Named() + " cannot be understood. It is kept as " + ToUtf8(kept) +
       ", and the defaults hold.");
  return {};
}

/// Keeps the file as it was, in which something stands under this name that is not what must be
/// written in its place.
std::string CFileProfile::KeepCopy(const std::string& text, const std::string& name) {
  std::error_code error;
  const fs::path kept = NameForDamaged(m_file, error);
  if (!error) error = WriteWhole(kept, text);
  if (error) return "what it holds as " + name + " cannot be kept (" + Reason(error) + ")";
  Tell(Named() + " held something else as " + name + ". The file as it was is kept as " +
       ToUtf8(kept) + ".");
  return {};
}

std::string CFileProfile::Store(const std::string& section, const Change& change) {
  std::error_code error;
  fs::create_directories(m_file.parent_path(), error);
  if (error) return Reason(error);
  const CFileLock lock(LockOf(m_file), kPatience);
  Contents stored = ReadLocked(lock);
  if (!stored.refusal.empty()) return stored.refusal;
  CProfileSection& values = (*stored.sections)[section];
  change(values);
  const auto changed = ChangeSection(stored.text, section, values);
  if (!changed) return "what else it holds cannot be written again";
  if (changed->text.size() > kLargestFile) return "it holds too much";
  std::string refusal = changed->foreign.empty() ? "" : KeepCopy(stored.text, changed->foreign);
  if (refusal.empty()) refusal = Reason(WriteWhole(m_file, changed->text));
  if (!refusal.empty()) ListLost(values);
  return refusal;
}

}  // namespace

std::unique_ptr<CProfile> OpenProfile(const fs::path& file) {
  return std::make_unique<CFileProfile>(file);
}

}  // namespace platform
