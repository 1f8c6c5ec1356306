#pragma once

#include <filesystem>

namespace platform {

/// The folder where desktops keep programs' settings: $XDG_CONFIG_HOME where that is an absolute
/// path, else .config in the person's home; on Windows %APPDATA%. It need not exist yet. Empty
/// where the person has no home.
std::filesystem::path DefaultProfileFolder();

}  // namespace platform
