#include "platform/host/profile_folder.h"

#include <cstdlib>

namespace platform {

std::filesystem::path DefaultProfileFolder() {
  const char* configured = std::getenv("XDG_CONFIG_HOME");
  if (configured != nullptr && configured[0] == '/') return configured;
  const char* home = std::getenv("HOME");
  return std::filesystem::path(home == nullptr ? "." : home) / ".config";
}

}  // namespace platform
