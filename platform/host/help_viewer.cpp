#include "platform/host/help_viewer.h"

#include <SDL_filesystem.h>
#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <iostream>
#include <system_error>

namespace platform {
namespace {

namespace fs = std::filesystem;

/// The first of the folders that is there; empty where none is.
fs::path HelpFolder(const std::vector<fs::path>& folders) {
  char* base = SDL_GetBasePath();
  const fs::path program = base == nullptr ? "." : base;
  SDL_free(base);
  std::error_code error;
  for (const fs::path& folder : folders) {
    const fs::path place = program / folder;
    if (fs::is_directory(place, error)) return fs::canonical(place, error);
  }
  return {};
}

/// Runs the opener as a grandchild, so that it is nobody's to wait for when it ends.
void OpenDetached(const std::string& address) {
  const pid_t child = fork();
  if (child > 0) {
    while (waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
    }
  } else if (child == 0) {
    setsid();
    if (fork() != 0) _exit(0);
    const int nowhere = open("/dev/null", O_RDWR | O_CLOEXEC);
    for (int stream = 0; stream <= 2; ++stream) dup2(nowhere, stream);
    execlp("xdg-open", "xdg-open", address.c_str(), nullptr);
    _exit(127);
  }
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

bool StartHelpViewer(const std::vector<fs::path>& folders, const std::string& commandLine) {
  const fs::path page = HelpPage(folders, commandLine);
  if (page.empty()) {
    std::cerr << "The help pages are not there.\n";
    return false;
  }
  OpenDetached(page.string());
  return true;
}

}  // namespace platform
