#include "platform/atomic_file.h"

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

namespace platform {
namespace {

/// The rename itself must reach the disk too, or a power cut could bring the old file back.
void FlushFolder(const std::filesystem::path& folder) {
  const int descriptor = open(folder.c_str(), O_RDONLY | O_CLOEXEC);
  if (descriptor < 0) return;
  fsync(descriptor);
  close(descriptor);
}

bool WriteAll(int descriptor, const std::string& text) {
  std::size_t done = 0;
  while (done < text.size()) {
    const ssize_t written = write(descriptor, text.data() + done, text.size() - done);
    if (written < 0 && errno == EINTR) continue;
    if (written <= 0) return false;
    done += static_cast<std::size_t>(written);
  }
  return fsync(descriptor) == 0;
}

}  // namespace

CFileLock::CFileLock(const std::filesystem::path& lockFile)
    : m_nDescriptor(open(lockFile.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600)) {
  while (m_nDescriptor >= 0 && flock(m_nDescriptor, LOCK_EX) != 0 && errno == EINTR) {
  }
}

CFileLock::~CFileLock() {
  if (m_nDescriptor >= 0) close(m_nDescriptor);
}

bool ReplaceFile(const std::filesystem::path& file, const std::string& text) {
  const std::filesystem::path fresh = file.string() + ".new";
  const int descriptor = open(fresh.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
  if (descriptor < 0) return false;
  const bool written = WriteAll(descriptor, text);
  const bool closed = close(descriptor) == 0;
  if (!written || !closed || std::rename(fresh.c_str(), file.c_str()) != 0) {
    unlink(fresh.c_str());
    return false;
  }
  FlushFolder(file.parent_path());
  return true;
}

}  // namespace platform
