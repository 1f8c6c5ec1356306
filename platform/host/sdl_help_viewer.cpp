#include <SDL_filesystem.h>

#include <iostream>
#include <system_error>

#include "platform/host/help_opener.h"
#include "platform/host/help_viewer.h"
#include "platform/host/utf8_path.h"

namespace platform {
namespace {

namespace fs = std::filesystem;

/// A path that, where it is a relative one, lies beside the program.
fs::path ProgramPath(const fs::path& path) {
  char* base = SDL_GetBasePath();
  const fs::path program = FromUtf8(base == nullptr ? "." : base);
  SDL_free(base);
  return program / path;
}

/// The first of the folders that is there; empty where none is.
fs::path HelpFolder(const std::vector<fs::path>& folders) {
  std::error_code error;
  for (const fs::path& folder : folders) {
    const fs::path place = ProgramPath(folder);
    if (!fs::is_directory(place, error)) continue;
    const fs::path real = fs::canonical(place, error);
    return error ? place : real;  // on another machine there is no telling
  }
  return {};
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
    trouble = "The help pages are not in " +
              ToUtf8(ProgramPath(folders.front()).lexically_normal()) + ".";
  } else if (!OpenInBrowser(page, milliseconds)) {
    trouble = "The help cannot be shown in a browser; it lies in " + ToUtf8(page) + ".";
  }
  if (!trouble.empty()) std::cerr << trouble << '\n';
  return trouble;
}

}  // namespace platform
