#include "platform/host/sdl_fonts.h"

#include <array>
#include <cstdio>
#include <memory>

#include "platform/host/sdl_library.h"

namespace platform {
namespace {

/// What is needed of fontconfig, by the names and types that it gives to programs. They are said
/// here so that it need not be there to build with, either.
class FontLibrary : public SdlLibrary {
 public:
  FontLibrary() : SdlLibrary("libfontconfig.so.1") {
    Load(m_pNameParse, "FcNameParse");
    Load(m_pConfigSubstitute, "FcConfigSubstitute");
    Load(m_pDefaultSubstitute, "FcDefaultSubstitute");
    Load(m_pFontMatch, "FcFontMatch");
    Load(m_pPatternGetString, "FcPatternGetString");
    Load(m_pPatternGetInteger, "FcPatternGetInteger");
    Load(m_pPatternDestroy, "FcPatternDestroy");
    Load(m_pFini, "FcFini");
  }
  ~FontLibrary() {
    if (IsComplete()) m_pFini();
  }
  FontLibrary(const FontLibrary&) = delete;
  FontLibrary& operator=(const FontLibrary&) = delete;

  FontFile Match(const char* description) const {
    const auto wanted = Own(m_pNameParse(description));
    m_pConfigSubstitute(nullptr, wanted.get(), 0);
    m_pDefaultSubstitute(wanted.get());
    int result = 0;
    const auto found = Own(m_pFontMatch(nullptr, wanted.get(), &result));
    const char* path = nullptr;
    FontFile file;
    if (found == nullptr || m_pPatternGetString(found.get(), "file", 0, &path) != 0) return file;
    file.path = path;
    m_pPatternGetInteger(found.get(), "index", 0, &file.index);
    return file;
  }

 private:
  struct Pattern;

  std::unique_ptr<Pattern, void (*)(Pattern*)> Own(Pattern* pattern) const {
    return {pattern, m_pPatternDestroy};
  }

  Pattern* (*m_pNameParse)(const char*) = nullptr;
  int (*m_pConfigSubstitute)(void*, Pattern*, int) = nullptr;
  void (*m_pDefaultSubstitute)(Pattern*) = nullptr;
  Pattern* (*m_pFontMatch)(void*, Pattern*, int*) = nullptr;
  int (*m_pPatternGetString)(const Pattern*, const char*, int, const char**) = nullptr;
  int (*m_pPatternGetInteger)(const Pattern*, const char*, int, int*) = nullptr;
  void (*m_pPatternDestroy)(Pattern*) = nullptr;
  void (*m_pFini)() = nullptr;
};

}  // namespace

FontFile FindDesktopFont(char32_t character) {
  static const FontLibrary library;
  if (!library.IsComplete()) return {};
  // Letters are drawn from outlines, in one colour. A size would follow a bare hyphen.
  std::array<char, 80> description{};
  std::snprintf(description.data(), description.size(),
                "sans\\-serif:charset=%x:outline=true:color=false",
                static_cast<unsigned>(character));
  return library.Match(description.data());
}

}  // namespace platform
