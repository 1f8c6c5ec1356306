#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

#include "platform/store/atomic_file.h"

namespace platform {
namespace {

namespace fs = std::filesystem;
using std::chrono::steady_clock;

std::error_code LastError() { return {errno, std::generic_category()}; }

/// The rename itself must reach the disk too, or a power cut could bring the old file back.
void FlushFolder(const fs::path& folder) {
  const int descriptor = open(folder.c_str(), O_RDONLY | O_CLOEXEC);
  if (descriptor < 0) return;
  fsync(descriptor);
  close(descriptor);
}

std::error_code WriteAll(int descriptor, const std::string& text) {
  std::size_t done = 0;
  while (done < text.size()) {
    const ssize_t written = write(descriptor, text.data() + done, text.size() - done);
    if (written < 0 && errno == EINTR) continue;
    if (written == 0) return make_error_code(std::errc::io_error);
    if (written < 0) return LastError();
    done += static_cast<std::size_t>(written);
  }
  // Some file systems have nothing to flush.
  return fsync(descriptor) == 0 || errno == EINVAL ? std::error_code{} : LastError();
}

/// The permissions of a file; of one that is not there, those of what is nobody else's business.
mode_t PermissionsOf(const fs::path& file) {
  struct stat status {};
  constexpr mode_t kPermissions = 07777;
  return stat(file.c_str(), &status) == 0 ? status.st_mode & kPermissions : 0600;
}

/// Makes a file that is as if it had always been there, once it is renamed.
std::error_code WriteFresh(const fs::path& fresh, const std::string& text, mode_t permissions) {
  unlink(fresh.c_str());  // what an earlier run may have left, or a link to somewhere else
  const int descriptor = open(fresh.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600);
  if (descriptor < 0) return LastError();
  std::error_code error = WriteAll(descriptor, text);
  if (!error && fchmod(descriptor, permissions) != 0) error = LastError();
  if (close(descriptor) != 0 && !error) error = LastError();
  return error;
}

/// Whether a lock failed as the file system knows of none.
bool HasNoLocks(const std::error_code& error) {
  return error == std::errc::no_lock_available || error == std::errc::function_not_supported ||
         error == std::errc::operation_not_supported || error == std::errc::invalid_argument;
}

std::error_code Lock(int descriptor, std::chrono::milliseconds patience) {
  constexpr useconds_t kBetween = 1000;  // microseconds; short, as others come between
  const auto end = steady_clock::now() + patience;
  while (flock(descriptor, LOCK_EX | LOCK_NB) != 0) {
    const std::error_code error = LastError();
    const bool held = error == std::errc::operation_would_block;
    if (HasNoLocks(error)) return {};
    if (!held && error != std::errc::interrupted) return error;
    if (steady_clock::now() >= end) return error;
    usleep(kBetween);
  }
  return {};
}

}  // namespace

bool MayPass(const std::error_code&, std::chrono::milliseconds&) { return false; }

CFileLock::CFileLock(const fs::path& lockFile, std::chrono::milliseconds patience)
    : m_nDescriptor(open(lockFile.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, 0600)),
      m_error(m_nDescriptor < 0 ? LastError() : Lock(m_nDescriptor, patience)) {}

CFileLock::~CFileLock() {
  if (m_nDescriptor >= 0) close(m_nDescriptor);
}

std::error_code WriteWhole(const fs::path& file, const std::string& text) {
  if (access(file.c_str(), W_OK) != 0 && errno != ENOENT) return LastError();
  const fs::path fresh = fs::path(file) += ".new";
  const fs::path folder = file.parent_path();
  std::error_code error = WriteFresh(fresh, text, PermissionsOf(file));
  if (!error && std::rename(fresh.c_str(), file.c_str()) != 0) error = LastError();
  if (error) {
    unlink(fresh.c_str());
  } else {
    FlushFolder(folder);
  }
  return error;
}

}  // namespace platform
