#include "platform/host/sdl_placement.h"

#include <algorithm>
#include <string_view>

#include "platform/host/frame_fit.h"
#include "platform/host/sdl_desktop.h"

namespace platform {
namespace {

/// The share of the desktop's room that a window may take and still feel comfortable, and what of
/// that a whole multiple must fill to be preferred when it opens, both in percent.
constexpr int kComfortablePercent = 90;
constexpr int kFirstLeastPercent = 75;
/// Window managers put a bar of about so many rows above what they have put in the middle.
constexpr int kTitleBar = 24;

Rect ToRect(const SDL_Rect& rect) { return RectAt({rect.x, rect.y}, {rect.w, rect.h}); }

bool AreOneSize(const Rect& a, const Rect& b) {
  return a.Width() == b.Width() && a.Height() == b.Height();
}

using Bounds = decltype(SDL_GetDisplayBounds);

/// All displays, by what SDL answers of each: all of it, or what panels leave to windows.
std::vector<Rect> Displays(Bounds* boundsOf) {
  std::vector<Rect> displays;
  for (int i = 0; i < SDL_GetNumVideoDisplays(); ++i) {
    SDL_Rect bounds;
    if (boundsOf(i, &bounds) == 0) displays.push_back(ToRect(bounds));
  }
  return displays;
}

/// Wayland tells no program where its windows stand; what SDL makes up changes by itself.
bool KnowsPlaces() { return std::string_view(SDL_GetCurrentVideoDriver()) != "wayland"; }

}  // namespace

Size ComfortableSize(Size frame) {
  const std::vector<Rect> displays = Displays(SDL_GetDisplayUsableBounds);
  if (displays.empty()) return frame;
  const auto comfortable = [](int side) {
    return std::max(1, std::min(side * kComfortablePercent / 100, side - 2 * kTitleBar));
  };
  return FittingSize(frame, {comfortable(displays[0].Width()), comfortable(displays[0].Height())},
                     kFirstLeastPercent);
}

SdlPlacement::SdlPlacement(SDL_Window* window) : m_pWindow(window), m_rcAsked(CurrentRect()) {}

Rect SdlPlacement::CurrentRect() const {
  Point at;
  Size size;
  if (KnowsPlaces()) SDL_GetWindowPosition(m_pWindow, &at.x, &at.y);
  SDL_GetWindowSize(m_pWindow, &size.width, &size.height);
  return RectAt(at, size);
}

/// Whoever leaves a window under a panel finds it there again: desktops have one measure for the
/// panels of all displays. One that must be moved stands clear of them.
Rect SdlPlacement::OnDesktop(const Rect& rect) const {
  const auto onto = [this, &rect](Bounds* boundsOf) {
    std::vector<Rect> displays = Displays(boundsOf);
    for (Rect& display : displays) display = StillThere(m_pWindow, display);
    std::erase_if(displays, [](const Rect& display) { return display.IsEmpty(); });
    return MovedOnto(displays, rect);
  };
  return onto(SDL_GetDisplayBounds) == rect ? rect : onto(SDL_GetDisplayUsableBounds);
}

Rect SdlPlacement::OnDesktopWithBar(Rect inside) const {
  inside.top -= BarHeight();
  Rect moved = OnDesktop(inside);
  moved.top += BarHeight();
  return moved;
}

void SdlPlacement::PutAt(const Rect& rect) {
  SDL_SetWindowSize(m_pWindow, rect.Width(), rect.Height());
  SDL_SetWindowPosition(m_pWindow, rect.left, rect.top);
  // Some window managers put their bar there.
  const Point at = rect.TopLeft() + rect.TopLeft() - CurrentRect().TopLeft();
  if (at != rect.TopLeft()) SDL_SetWindowPosition(m_pWindow, at.x, at.y);
}

void SdlPlacement::Ask(const WindowPlace& place) {
  m_bAsked = true;
  m_bOpensMaximized = place.maximized;
  m_rcAsked = OnDesktop(place.rect);
  PutAt(m_rcAsked);
}

void SdlPlacement::Show() {
  SDL_ShowWindow(m_pWindow);
  SDL_PumpEvents();
  m_rcOpened = CurrentRect();
  const Rect inside = OnDesktopWithBar(m_rcOpened);
  if (inside != m_rcOpened) PutAt(inside);
  m_rcNormal = CurrentRect();
  if (m_bOpensMaximized) SDL_MaximizeWindow(m_pWindow);
}

void SdlPlacement::Settle() {
  if (!IsFullScreen() && !IsMaximized()) m_rcNormal = CurrentRect();
}

/// A window manager counts its bar when it is told where to open a window, and not when it says
/// where the window is. Without a look at that the window would wander from run to run.
std::optional<WindowPlace> SdlPlacement::Place() const {
  const bool moved = m_rcNormal != m_rcOpened;
  if (!m_bAsked && !moved && !IsMaximized()) return std::nullopt;
  const Point bar = m_rcOpened.TopLeft() - m_rcAsked.TopLeft();
  return WindowPlace{moved ? m_rcNormal.Moved(Point{} - bar) : m_rcAsked, IsMaximized()};
}

bool SdlPlacement::IsFullScreen() const {
  return m_bFillsDisplay || (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_FULLSCREEN) != 0;
}

bool SdlPlacement::IsMaximized() const {
  return IsFullScreen() ? m_bMaximizedBefore
                        : (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_MAXIMIZED) != 0;
}

int SdlPlacement::BarHeight() const {
  if (const int bar = BarAbove(m_pWindow); bar > 0) return bar;
  const int height = m_rcOpened.top - m_rcAsked.top;
  return height > 0 && height <= 2 * kTitleBar ? height : 0;
}

void SdlPlacement::ToggleFullScreen() {
  if (IsFullScreen()) {
    LeaveFullScreen();
  } else {
    EnterFullScreen();
  }
}

void SdlPlacement::EnterFullScreen() {
  m_bMaximizedBefore = IsMaximized();
  if (KnowsFullScreen(m_pWindow)) {
    SDL_SetWindowFullscreen(m_pWindow, SDL_WINDOW_FULLSCREEN_DESKTOP);
    return;
  }
  SDL_Rect display;
  if (SDL_GetDisplayBounds(SDL_GetWindowDisplayIndex(m_pWindow), &display) != 0) return;
  m_bFillsDisplay = true;
  PutAt(StillThere(m_pWindow, ToRect(display)));
}

/// The display may have become smaller meanwhile, and SDL may believe that the window is still as
/// large as the display.
void SdlPlacement::LeaveFullScreen() {
  const Rect display = CurrentRect();
  const Rect back = OnDesktopWithBar(m_rcNormal);
  if (!m_bFillsDisplay) SDL_SetWindowFullscreen(m_pWindow, 0);
  m_bFillsDisplay = false;
  if (m_bMaximizedBefore) {
    SDL_MaximizeWindow(m_pWindow);
  } else if (back != m_rcNormal || AreOneSize(CurrentRect(), display)) {
    PutAt(back);
  }
}

}  // namespace platform
