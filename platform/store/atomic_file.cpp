#include "platform/store/atomic_file.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
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
  // Some file systems have nothing to flush.
  return fsync(descriptor) == 0 || errno == EINVAL;
}

/// The permissions of a file; of one that is not there, those of what is nobody else's business.
mode_t PermissionsOf(const std::filesystem::path& file) {
  struct stat status {};
  constexpr mode_t kPermissions = 07777;
  return stat(file.c_str(), &status) == 0 ? status.st_mode & kPermissions : 0600;
}

bool MayBeWritten(const std::filesystem::path& file) {
  return access(file.c_str(), W_OK) == 0 || errno == ENOENT;
}

}  // namespace

CFileLock::CFileLock(const std::filesystem::path& lockFile)
    : m_nDescriptor(open(lockFile.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600)) {
  constexpr int kTries = 2000;
  constexpr useconds_t kBetween = 1000;  // microseconds; short, as others come between
  for (int i = 0; m_nDescriptor >= 0 && flock(m_nDescriptor, LOCK_EX | LOCK_NB) != 0; ++i) {
    m_bRefused = i >= kTries;
    if (m_bRefused || (errno != EWOULDBLOCK && errno != EINTR)) break;
    usleep(kBetween);
  }
}

CFileLock::~CFileLock() {
  if (m_nDescriptor >= 0) close(m_nDescriptor);
}

bool ReplaceFile(const std::filesystem::path& file, const std::string& text) {
  if (!MayBeWritten(file)) return false;
  const std::filesystem::path fresh = file.string() + ".new";
  unlink(fresh.c_str());  // what an earlier run may have left, or a link to somewhere else
  const int descriptor = open(fresh.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600);
  if (descriptor < 0) return false;
  const bool written = WriteAll(descriptor, text) && fchmod(descriptor, PermissionsOf(file)) == 0;
  const bool closed = close(descriptor) == 0;
  if (!written || !closed || std::rename(fresh.c_str(), file.c_str()) != 0) {
    unlink(fresh.c_str());
    return false;
  }
  FlushFolder(file.parent_path());
  return true;
}

}  // namespace platform
