#include <windows.h>
// Behind the above, which it cannot do without.
#include <shlobj.h>

#include <array>
#include <cwchar>

#include "platform/host/profile_folder.h"

namespace platform {

std::filesystem::path DefaultProfileFolder() {
  const wchar_t* value = _wgetenv(L"APPDATA");
  std::filesystem::path folder = value == nullptr ? L"" : value;
  // A folder of another machine, \\server\share, has no root that the standard library knows of.
  if (folder.has_root_directory()) return folder;
  std::array<wchar_t, MAX_PATH> known{};
  const bool found =
      SHGetFolderPathW(nullptr, CSIDL_APPDATA, nullptr, SHGFP_TYPE_CURRENT, known.data()) == S_OK;
  return found ? known.data() : L"";
}

}  // namespace platform
