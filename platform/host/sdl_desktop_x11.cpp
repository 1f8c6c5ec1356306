#include <SDL_syswm.h>

#include <algorithm>
#include <optional>

#include "platform/host/sdl_desktop.h"
#include "platform/host/sdl_library.h"

namespace platform {
namespace {

/// What is needed of the X library, which SDL too loads only where the desktop is one of X.
class XLibrary : public SdlLibrary {
 public:
  explicit XLibrary(Display* display) : SdlLibrary("libX11.so.6"), m_pDisplay(display) {
    Load(m_pInternAtom, "XInternAtom");
    Load(m_pGetWindowProperty, "XGetWindowProperty");
    Load(m_pGetWindowAttributes, "XGetWindowAttributes");
    Load(m_pDefaultRootWindow, "XDefaultRootWindow");
    Load(m_pFree, "XFree");
  }

  /// Window managers are told what happens on the root window. One that has gone may have left its
  /// list of features behind.
  bool HasWindowManager() const { return (Root().all_event_masks & SubstructureRedirectMask) != 0; }

  /// Whether the window manager lists a feature as supported.
  bool DesktopSupports(const char* feature) const {
    const Atom wanted = m_pInternAtom(m_pDisplay, feature, False);
    const Atom list = m_pInternAtom(m_pDisplay, "_NET_SUPPORTED", False);
    constexpr long kMostWords = 4096;
    Atom type = 0;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char* bytes = nullptr;
    m_pGetWindowProperty(m_pDisplay, m_pDefaultRootWindow(m_pDisplay), list, 0, kMostWords, False,
                         AnyPropertyType, &type, &format, &count, &left, &bytes);
    if (bytes == nullptr) return false;
    constexpr int kAtomBits = 32;
    const auto* atoms = reinterpret_cast<const Atom*>(bytes);
    const bool found =
        format == kAtomBits && std::find(atoms, atoms + count, wanted) != atoms + count;
    m_pFree(bytes);
    return found;
  }

  XWindowAttributes Root() const {
    XWindowAttributes root{};
    m_pGetWindowAttributes(m_pDisplay, m_pDefaultRootWindow(m_pDisplay), &root);
    return root;
  }

 private:
  Display* m_pDisplay;
  decltype(XInternAtom)* m_pInternAtom = nullptr;
  decltype(XGetWindowProperty)* m_pGetWindowProperty = nullptr;
  decltype(XGetWindowAttributes)* m_pGetWindowAttributes = nullptr;
  decltype(XDefaultRootWindow)* m_pDefaultRootWindow = nullptr;
  decltype(XFree)* m_pFree = nullptr;
};

/// The X display that a window is on; null where the desktop is none of X.
Display* DisplayOf(SDL_Window* window) {
  SDL_SysWMinfo info;
  SDL_VERSION(&info.version);
  const bool onX =
      SDL_GetWindowWMInfo(window, &info) == SDL_TRUE && info.subsystem == SDL_SYSWM_X11;
  return onX ? info.info.x11.display : nullptr;
}

}  // namespace

bool KnowsFullScreen(SDL_Window* window) {
  Display* display = DisplayOf(window);
  if (display == nullptr) return true;
  const XLibrary library(display);
  return library.IsComplete() && library.HasWindowManager() &&
         library.DesktopSupports("_NET_WM_STATE_FULLSCREEN");
}

Rect StillThere(SDL_Window* window, const Rect& part) {
  Display* display = DisplayOf(window);
  if (display == nullptr) return part;
  const XLibrary library(display);
  if (!library.IsComplete()) return part;
  const XWindowAttributes root = library.Root();
  return part.Intersection(RectAt({}, {root.width, root.height}));
}

}  // namespace platform
