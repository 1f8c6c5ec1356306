#pragma once

#include <filesystem>

namespace platform {

/// Hands a page to the desktop's own browser, as a process that nothing waits for. False where that
/// could not be started, or is known within so many milliseconds to have failed.
bool OpenInBrowser(const std::filesystem::path& page, int milliseconds);

}  // namespace platform
