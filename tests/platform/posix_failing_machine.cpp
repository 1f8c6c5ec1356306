// These stand in place of the system's functions.

#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <ctime>

#include "tests/platform/failing_machine.h"

using namespace feltside::tests;

namespace {
int Fail() {
  errno = EIO;
  return -1;
}
}  // namespace

extern "C" ssize_t read(int descriptor, void* buffer, std::size_t size) {
  return g_bReadFails ? Fail() : syscall(SYS_read, descriptor, buffer, size);
}

extern "C" int fsync(int descriptor) {
  if (g_onFlush) g_onFlush(descriptor);
  return g_bFlushFails ? Fail() : static_cast<int>(syscall(SYS_fsync, descriptor));
}

extern "C" int usleep(useconds_t microseconds) {
  if (!g_bSleepsInNoTime) {
    const timespec time{0, static_cast<long>(microseconds) * 1000};
    return nanosleep(&time, nullptr);
  }
  g_nMicrosecondsSlept += microseconds;
  return 0;
}

extern "C" int clock_gettime(clockid_t clock, timespec* time) {
  constexpr long kSecond = 1000000000;
  const long answer = syscall(SYS_clock_gettime, clock, time);
  const long nanoseconds = time->tv_nsec + g_nMicrosecondsSlept * 1000;
  time->tv_sec += nanoseconds / kSecond;
  time->tv_nsec = nanoseconds % kSecond;
  return static_cast<int>(answer);
}
