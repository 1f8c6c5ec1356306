#pragma once

#include <memory>
#include <string>

#include "platform/host.h"

namespace platform {

/// A host with a window of the desktop, shown at a whole multiple of its pixels. Null where there
/// is no display to show a window on; `why` then says what is the matter.
std::unique_ptr<Host> CreateSdlHost(Size frameSize, std::string& why);

}  // namespace platform
