#pragma once

#include <string_view>

namespace platform {

/// Whether a text keeps clear of what toml++ 3.3 does not survive: letters beyond ASCII where they
/// have no place (undefined behaviour) and keys of thousands of parts (a stack that overflows). All
/// else that is wrong with a text, the parser itself finds.
bool IsSafeToml(std::string_view text);

}  // namespace platform
