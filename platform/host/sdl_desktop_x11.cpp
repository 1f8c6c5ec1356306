#include <SDL_syswm.h>

#include <algorithm>

#include "platform/host/sdl_desktop.h"

namespace platform {
namespace {

/// What is needed of the X library, which SDL too loads only where the desktop is one of X.
class XLibrary {
 public:
  XLibrary() : m_pLibrary(SDL_LoadObject("libX11.so.6")) {
    Load(m_pInternAtom, "XInternAtom");
    Load(m_pGetWindowProperty, "XGetWindowProperty");
    Load(m_pDefaultRootWindow, "XDefaultRootWindow");
    Load(m_pFree, "XFree");
  }
  ~XLibrary() { SDL_UnloadObject(m_pLibrary); }
  XLibrary(const XLibrary&) = delete;
  XLibrary& operator=(const XLibrary&) = delete;

  bool IsComplete() const { return m_bComplete; }

  /// Whether the window manager lists a feature as supported.
  bool DesktopSupports(Display* display, const char* feature) const {
    const Atom wanted = m_pInternAtom(display, feature, False);
    const Atom list = m_pInternAtom(display, "_NET_SUPPORTED", False);
    constexpr long kMostWords = 4096;
    Atom type = 0;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char* bytes = nullptr;
    m_pGetWindowProperty(display, m_pDefaultRootWindow(display), list, 0, kMostWords, False,
                         AnyPropertyType, &type, &format, &count, &left, &bytes);
    if (bytes == nullptr) return false;
    constexpr int kAtomBits = 32;
    const auto* atoms = reinterpret_cast<const Atom*>(bytes);
    const bool found =
        format == kAtomBits && std::find(atoms, atoms + count, wanted) != atoms + count;
    m_pFree(bytes);
    return found;
  }

 private:
  template <class Function>
  void Load(Function*& function, const char* name) {
    function = m_pLibrary == nullptr
                   ? nullptr
                   : reinterpret_cast<Function*>(SDL_LoadFunction(m_pLibrary, name));
    m_bComplete = m_bComplete && function != nullptr;
  }

  void* m_pLibrary;
  bool m_bComplete = true;
  decltype(XInternAtom)* m_pInternAtom = nullptr;
  decltype(XGetWindowProperty)* m_pGetWindowProperty = nullptr;
  decltype(XDefaultRootWindow)* m_pDefaultRootWindow = nullptr;
  decltype(XFree)* m_pFree = nullptr;
};

}  // namespace

bool KnowsFullScreen(SDL_Window* window) {
  SDL_SysWMinfo info;
  SDL_VERSION(&info.version);
  if (SDL_GetWindowWMInfo(window, &info) != SDL_TRUE || info.subsystem != SDL_SYSWM_X11)
    return true;
  const XLibrary library;
  return library.IsComplete() &&
         library.DesktopSupports(info.info.x11.display, "_NET_WM_STATE_FULLSCREEN");
}

}  // namespace platform
