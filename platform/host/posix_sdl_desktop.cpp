#include <SDL_syswm.h>

#include <algorithm>
#include <optional>

#include "platform/host/sdl_desktop.h"
#include "platform/host/sdl_library.h"

namespace platform {
namespace {

constexpr char kXLibrary[] = "libX11.so.6";

/// What is needed of the X library, which SDL too loads only where the desktop is one of X.
class XLibrary : public SdlLibrary {
 public:
  /// For the screen of a window, which need not be the display's first.
  explicit XLibrary(const SDL_SysWMinfo& window)
      : SdlLibrary(kXLibrary),
        m_pDisplay(window.info.x11.display),
        m_window(window.info.x11.window) {
    Load(m_pInternAtom, "XInternAtom");
    Load(m_pGetWindowProperty, "XGetWindowProperty");
    Load(m_pGetWindowAttributes, "XGetWindowAttributes");
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
    m_pGetWindowProperty(m_pDisplay, AttributesOf(m_window).root, list, 0, kMostWords, False,
                         AnyPropertyType, &type, &format, &count, &left, &bytes);
    if (bytes == nullptr) return false;
    constexpr int kAtomBits = 32;
    const auto* atoms = reinterpret_cast<const Atom*>(bytes);
    const bool found =
        format == kAtomBits && std::find(atoms, atoms + count, wanted) != atoms + count;
    m_pFree(bytes);
    return found;
  }

  XWindowAttributes Root() const { return AttributesOf(AttributesOf(m_window).root); }

 private:
  XWindowAttributes AttributesOf(Window window) const {
    XWindowAttributes attributes{};
    m_pGetWindowAttributes(m_pDisplay, window, &attributes);
    return attributes;
  }

  Display* m_pDisplay;
  Window m_window;
  decltype(XInternAtom)* m_pInternAtom = nullptr;
  decltype(XGetWindowProperty)* m_pGetWindowProperty = nullptr;
  decltype(XGetWindowAttributes)* m_pGetWindowAttributes = nullptr;
  decltype(XFree)* m_pFree = nullptr;
};

/// What SDL knows of a window on a desktop of X; nothing on another.
std::optional<SDL_SysWMinfo> OnX(SDL_Window* window) {
  SDL_SysWMinfo info;
  SDL_VERSION(&info.version);
  const bool onX =
      SDL_GetWindowWMInfo(window, &info) == SDL_TRUE && info.subsystem == SDL_SYSWM_X11;
  return onX ? std::optional(info) : std::nullopt;
}

}  // namespace

bool KnowsFullScreen(SDL_Window* window) {
  const auto info = OnX(window);
  if (!info) return true;
  const XLibrary library(*info);
  return library.IsComplete() && library.HasWindowManager() &&
         library.DesktopSupports("_NET_WM_STATE_FULLSCREEN");
}

// A window manager tells it by what it makes of the place that it is asked for.
int BarAbove(SDL_Window*) { return 0; }

Rect StillThere(SDL_Window* window, const Rect& part) {
  const auto info = OnX(window);
  if (!info) return part;
  const XLibrary library(*info);
  if (!library.IsComplete()) return part;
  const XWindowAttributes root = library.Root();
  return part.Intersection(RectAt({}, {root.width, root.height}));
}

// Who starts a program here is told by its streams.
void ShowTrouble(const std::string&) {}

DesktopPatience::DesktopPatience() {
  m_library.emplace(kXLibrary);
  decltype(XSetErrorHandler)* setErrorHandler = nullptr;
  m_library->Load(setErrorHandler, "XSetErrorHandler");
  if (setErrorHandler == nullptr) return;
  static XErrorHandler otherwise = nullptr;
  const XErrorHandler before = setErrorHandler([](Display* display, XErrorEvent* error) {
    return error->error_code == BadWindow ? 0 : otherwise(display, error);
  });
  if (otherwise == nullptr) otherwise = before;
}

}  // namespace platform
