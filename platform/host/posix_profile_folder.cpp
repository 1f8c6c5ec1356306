#include <pwd.h>
#include <unistd.h>

#include <cstdlib>

#include "platform/host/profile_folder.h"

namespace platform {
namespace {

/// What a variable of the environment names as an absolute path; empty where it does not.
std::filesystem::path PathIn(const char* variable) {
  const char* value = std::getenv(variable);
  return value != nullptr && value[0] == '/' ? value : "";
}

/// The person's home, also where a program was started without an environment.
std::filesystem::path Home() {
  if (std::filesystem::path home = PathIn("HOME"); !home.empty()) return home;
  const passwd* user = getpwuid(getuid());
  return user != nullptr && user->pw_dir[0] == '/' ? user->pw_dir : "";
}

}  // namespace

std::filesystem::path DefaultProfileFolder() {
  if (std::filesystem::path folder = PathIn("XDG_CONFIG_HOME"); !folder.empty()) return folder;
  const std::filesystem::path home = Home();
  return home.empty() ? home : home / ".config";
}

}  // namespace platform
