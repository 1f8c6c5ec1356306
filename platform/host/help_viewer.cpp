#include "platform/host/help_viewer.h"

#include <SDL_filesystem.h>
#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <iostream>
#include <system_error>

namespace platform {
namespace {

namespace fs = std::filesystem;

/// A path that, where it is a relative one, lies beside the program.
fs::path ProgramPath(const fs::path& path) {
  char* base = SDL_GetBasePath();
  const fs::path program = base == nullptr ? "." : base;
  SDL_free(base);
  return (program / path).lexically_normal();
}

/// The first of the folders that is there; empty where none is.
fs::path HelpFolder(const std::vector<fs::path>& folders) {
  std::error_code error;
  for (const fs::path& folder : folders) {
    const fs::path place = ProgramPath(folder);
    if (fs::is_directory(place, error)) return fs::canonical(place, error);
  }
  return {};
}

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

/// Runs the opener as a grandchild, so that it is nobody's to wait for when it ends. False where it
/// could not be started, or has failed within so many milliseconds.
bool OpenDetached(const std::string& address, int milliseconds) {
  int ends[2];
  if (pipe2(ends, O_CLOEXEC) != 0) return false;
  const pid_t child = fork();
  if (child == 0) {
    setsid();
    if (fork() == 0) BecomeOpener(address, ends[1]);
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

}  // namespace

fs::path HelpPage(const std::vector<fs::path>& folders, const std::string& commandLine) {
  const std::string scheme = "file:";
  if (commandLine.compare(0, scheme.size(), scheme) != 0) return {};
  const std::string target = commandLine.substr(scheme.size());
  const std::size_t anchor = target.find('#');
  const std::string page = target.substr(0, anchor);
  const fs::path folder = HelpFolder(folders);
  if (folder.empty()) return {};
  std::error_code error;
  if (anchor != std::string::npos) {
    fs::path topic =
        folder / (fs::path(page).stem().string() + "-" + target.substr(anchor + 1) + ".htm");
    if (fs::is_regular_file(topic, error)) return topic;
  }
  return fs::is_regular_file(folder / page, error) ? folder / page : fs::path{};
}

std::string StartHelpViewer(const std::vector<fs::path>& folders, const std::string& commandLine,
                            int milliseconds) {
  const fs::path page = HelpPage(folders, commandLine);
  std::string trouble;
  if (page.empty()) {
    trouble = "The help pages are not in " + ProgramPath(folders.front()).string() + ".";
  } else if (!OpenDetached(page.string(), milliseconds)) {
    trouble = "The help cannot be shown in a browser; it lies in " + page.string() + ".";
  }
  if (!trouble.empty()) std::cerr << trouble << '\n';
  return trouble;
}

}  // namespace platform
