#include "platform/draw/font_finder.h"

namespace platform {
namespace {
FontFinder g_pFinder = nullptr;
}  // namespace

void SetFontFinder(FontFinder finder) { g_pFinder = finder; }

FontFile FindFontFile(char32_t character) {
  return g_pFinder == nullptr ? FontFile{} : g_pFinder(character);
}

}  // namespace platform
