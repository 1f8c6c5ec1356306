#include <windows.h>
// Behind the above, which it cannot do without.
#include <shellapi.h>

#include "platform/host/help_opener.h"

namespace platform {

bool OpenInBrowser(const std::filesystem::path& page, int) {
  constexpr INT_PTR kLastFailure = 32;
  const auto answer =
      ShellExecuteW(nullptr, L"open", page.c_str(), nullptr, nullptr, SW_SHOWNORMAL);
  return reinterpret_cast<INT_PTR>(answer) > kLastFailure;
}

}  // namespace platform
