#include <cwchar>

#include "platform/host/profile_folder.h"

namespace platform {

std::filesystem::path DefaultProfileFolder() {
  const wchar_t* value = _wgetenv(L"APPDATA");
  const std::filesystem::path folder = value == nullptr ? L"" : value;
  return folder.is_absolute() ? folder : "";
}

}  // namespace platform
