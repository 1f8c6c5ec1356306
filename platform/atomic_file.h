#pragma once

#include <filesystem>
#include <string>

namespace platform {

/// Holds a lock that other processes respect for as long as it lives; without effect where the lock
/// file cannot be made.
class CFileLock {
 public:
  explicit CFileLock(const std::filesystem::path& lockFile);
  ~CFileLock();
  CFileLock(const CFileLock&) = delete;
  CFileLock& operator=(const CFileLock&) = delete;

 private:
  int m_nDescriptor;
};

/// Writes a new file beside the old one, flushes it to the disk and renames it over the old one.
/// Answers whether all of that went well; otherwise the old file is as it was.
bool ReplaceFile(const std::filesystem::path& file, const std::string& text);

}  // namespace platform
