#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "platform/host/host.h"

namespace platform {

/// What the host must know of the program.
struct HostOptions {
  Size frameSize;  ///< of every picture that it is to show, in pixels
  /// Where the help pages may lie, the first that is there holds; relative to the program's folder.
  std::vector<std::filesystem::path> helpFolders;
};

/// The host of the machine that the program is built for: each such host defines this one function.
/// Null where there is no display to show a window on; `why` then says what is the matter.
std::unique_ptr<Host> CreateHost(const HostOptions& options, std::string& why);

}  // namespace platform
