#pragma once

#include <chrono>
#include <filesystem>
#include <string>
#include <system_error>

namespace platform {

/// How long a scanner or another game may have a file open before it counts as kept from us.
constexpr std::chrono::milliseconds kPatienceWithPrograms{1000};

/// Whether it is worth trying again to open a file that could not be opened, as another program may
/// have it to itself for a moment. Then this waits for a part of the time that is `left`.
bool MayPass(const std::error_code& error, std::chrono::milliseconds& left);

/// Holds a lock that other processes respect for as long as it lives. On a file system that knows
/// no locks it holds nothing, and refuses nothing.
class CFileLock {
 public:
  /// Waits so long for whoever holds it.
  CFileLock(const std::filesystem::path& lockFile, std::chrono::milliseconds patience);
  ~CFileLock();
  CFileLock(const CFileLock&) = delete;
  CFileLock& operator=(const CFileLock&) = delete;

  /// Why it is not held, if so: std::errc::operation_would_block where somebody else still holds
  /// it.
  std::error_code Error() const { return m_error; }

 private:
  int m_nDescriptor;
  std::error_code m_error;
};

/// Writes a new file beside the old one, with the old one's permissions (on Windows, those of its
/// folder), flushes it to the disk and renames it over the old one. Answers what went wrong, if
/// anything did; then, as with a file that may not be written, the old file is as it was.
std::error_code WriteWhole(const std::filesystem::path& file, const std::string& text);

}  // namespace platform
