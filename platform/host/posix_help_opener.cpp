#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <string>

#include "platform/host/help_opener.h"

namespace platform {
namespace {

/// Where the opener tells that it failed; a number that every shell can redirect.
constexpr int kFailureStream = 3;

/// Becomes the opener, with nothing of it reaching the program's streams. When it fails, something
/// is written into the pipe; in any case that is closed when it ends.
[[noreturn]] void BecomeOpener(const std::string& address, int pipe) {
  const int nowhere = open("/dev/null", O_RDWR | O_CLOEXEC);
  for (int stream = 0; stream < kFailureStream; ++stream) dup2(nowhere, stream);
  const int failure = fcntl(pipe, F_DUPFD, kFailureStream + 1);
  dup2(failure, kFailureStream);
  close(failure);
  execl("/bin/sh", "sh", "-c", "xdg-open \"$1\" 3>&- || echo failed >&3", "sh", address.c_str(),
        nullptr);
  _exit(127);
}

/// Calls a system function again for as long as only a signal keeps it from its work.
template <class Call>
auto Insist(const Call& call) {
  auto result = call();
  while (result < 0 && errno == EINTR) result = call();
  return result;
}

}  // namespace

/// Runs the opener as a grandchild, so that it is nobody's to wait for when it ends.
bool OpenInBrowser(const std::filesystem::path& page, int milliseconds) {
  int ends[2];
  if (pipe2(ends, O_CLOEXEC) != 0) return false;
  const pid_t child = fork();
  if (child == 0) {
    setsid();
    if (fork() == 0) BecomeOpener(page.string(), ends[1]);
    _exit(0);
  }
  close(ends[1]);
  if (child > 0) Insist([child] { return waitpid(child, nullptr, 0); });
  pollfd failure{ends[0], POLLIN, 0};
  const bool ended = Insist([&] { return poll(&failure, 1, milliseconds); }) > 0;
  char sign = 0;
  const bool failed = ended && Insist([&] { return read(ends[0], &sign, 1); }) != 0;
  close(ends[0]);
  return child > 0 && !failed;
}

}  // namespace platform
