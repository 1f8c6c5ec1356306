#include <fcntl.h>
#include <io.h>
#include <share.h>
#include <sys/stat.h>
#include <unistd.h>
#include <windows.h>

#include <algorithm>
#include <cerrno>

#include "platform/store/atomic_file.h"

namespace platform {
namespace {

namespace fs = std::filesystem;
using std::chrono::milliseconds;

constexpr milliseconds kBetween{10};  ///< two tries

std::error_code LastError() { return {errno, std::generic_category()}; }

/// The same as the C library would call it, whose words are those of every other machine.
std::error_code Translated(DWORD error) {
  const std::error_code raw(static_cast<int>(error), std::system_category());
  const std::error_condition known = raw.default_error_condition();
  return make_error_code(known.category() == std::generic_category()
                             ? static_cast<std::errc>(known.value())
                             : std::errc::io_error);
}

std::error_code WriteAll(int descriptor, const std::string& text) {
  const int written = _write(descriptor, text.data(), static_cast<unsigned>(text.size()));
  if (written < 0) return LastError();
  // A disk that is full takes a part.
  if (static_cast<std::size_t>(written) < text.size()) {
    return make_error_code(std::errc::no_space_on_device);
  }
  return _commit(descriptor) == 0 ? std::error_code{} : LastError();
}

std::error_code WriteFresh(const fs::path& fresh, const std::string& text) {
  _wunlink(fresh.c_str());  // what an earlier run may have left
  const int descriptor =
      _wopen(fresh.c_str(), _O_WRONLY | _O_CREAT | _O_EXCL | _O_BINARY | _O_NOINHERIT,
             _S_IREAD | _S_IWRITE);
  if (descriptor < 0) return LastError();
  std::error_code error = WriteAll(descriptor, text);
  if (_close(descriptor) != 0 && !error) error = LastError();
  return error;
}

/// Sleeps for a part of the time that is left; false: none is left.
bool Wait(milliseconds& left) {
  if (left <= milliseconds::zero()) return false;
  const ULONGLONG start = GetTickCount64();
  usleep(static_cast<useconds_t>(std::chrono::microseconds(kBetween).count()));
  // The system may make it longer.
  left -= std::max(kBetween, milliseconds(GetTickCount64() - start));
  return true;
}

/// Puts a file in the place of another in one step, which the disk has done when this returns. That
/// cannot be while somebody has the other one open.
std::error_code Rename(const fs::path& from, const fs::path& to) {
  milliseconds left = kPatienceWithPrograms;
  while (
      !MoveFileExW(from.c_str(), to.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH)) {
    const DWORD error = GetLastError();
    const bool open = error == ERROR_SHARING_VIOLATION || error == ERROR_ACCESS_DENIED;
    if (!open) return Translated(error);
    if (!Wait(left)) return make_error_code(std::errc::device_or_resource_busy);
  }
  return {};
}

std::error_code Lock(int descriptor, milliseconds left) {
  // NOLINTNEXTLINE(performance-no-int-to-ptr): the run-time library tells a handle as a number
  auto* const file = reinterpret_cast<HANDLE>(_get_osfhandle(descriptor));
  OVERLAPPED start{};
  while (!LockFileEx(file, LOCKFILE_EXCLUSIVE_LOCK | LOCKFILE_FAIL_IMMEDIATELY, 0, 1, 0, &start)) {
    const DWORD error = GetLastError();
    const bool held = error == ERROR_LOCK_VIOLATION || error == ERROR_IO_PENDING;
    if (!held) return {};  // a file system without locks
    if (!Wait(left)) return make_error_code(std::errc::operation_would_block);
  }
  return {};
}

}  // namespace

bool MayPass(const std::error_code& error, milliseconds& left) {
  return error == std::errc::permission_denied && Wait(left);
}

CFileLock::CFileLock(const fs::path& lockFile, milliseconds patience)
    : m_nDescriptor(_wsopen(lockFile.c_str(), _O_RDWR | _O_CREAT | _O_BINARY | _O_NOINHERIT,
                            _SH_DENYNO, _S_IREAD | _S_IWRITE)),
      m_error(m_nDescriptor < 0 ? LastError() : Lock(m_nDescriptor, patience)) {}

CFileLock::~CFileLock() {
  if (m_nDescriptor >= 0) _close(m_nDescriptor);
}

std::error_code WriteWhole(const fs::path& file, const std::string& text) {
  constexpr int kToWrite = 2;
  if (_waccess(file.c_str(), kToWrite) != 0 && errno != ENOENT) return LastError();
  const fs::path fresh = fs::path(file) += ".new";
  std::error_code error = WriteFresh(fresh, text);
  if (!error) error = Rename(fresh, file);
  if (error) _wunlink(fresh.c_str());
  return error;
}

}  // namespace platform
