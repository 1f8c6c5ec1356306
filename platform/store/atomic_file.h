#pragma once

#include <filesystem>
#include <string>

namespace platform {

/// Holds a lock that other processes respect for as long as it lives; without effect where the lock
/// file cannot be made.
class CFileLock {
 public:
  /// Waits for whoever holds it, but not longer than a person would.
  explicit CFileLock(const std::filesystem::path& lockFile);
  ~CFileLock();
  CFileLock(const CFileLock&) = delete;
  CFileLock& operator=(const CFileLock&) = delete;

  /// Whether somebody else still holds it.
  bool IsRefused() const { return m_bRefused; }

 private:
  int m_nDescriptor;
  bool m_bRefused = false;
};

/// Writes a new file beside the old one, with the old one's permissions, flushes it to the disk and
/// renames it over the old one. Answers whether all of that went well; otherwise, as with a file
/// that may not be written, the old file is as it was.
bool ReplaceFile(const std::filesystem::path& file, const std::string& text);

}  // namespace platform
