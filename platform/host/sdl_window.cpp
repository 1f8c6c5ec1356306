#include "platform/host/sdl_window.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

#include "platform/host/frame_scaling.h"
#include "platform/host/sdl_desktop.h"

namespace platform {
namespace {

/// The share of the desktop's room that a window may take and still feel comfortable, and what of
/// that a whole multiple must fill to be preferred when it opens, both in percent.
constexpr int kComfortablePercent = 90;
constexpr int kFirstLeastPercent = 75;
/// Window managers put a bar of about so many rows above what they have put in the middle.
constexpr int kTitleBar = 24;

/// The colour around a picture that does not fill the window.
constexpr Uint8 kSurround = 32;

Size SizeOf(const Rect& rect) { return {rect.Width(), rect.Height()}; }

Rect ToRect(const SDL_Rect& rect) { return RectAt({rect.x, rect.y}, {rect.w, rect.h}); }

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

Size ComfortableSize(Size frame) {
  const std::vector<Rect> displays = Displays(SDL_GetDisplayUsableBounds);
  if (displays.empty()) return frame;
  const auto comfortable = [](int side) {
    return std::max(1, std::min(side * kComfortablePercent / 100, side - 2 * kTitleBar));
  };
  return FittingSize(frame, {comfortable(displays[0].Width()), comfortable(displays[0].Height())},
                     kFirstLeastPercent);
}

/// Wayland tells no program where its windows stand; what SDL makes up changes by itself.
bool KnowsPlaces() { return std::string_view(SDL_GetCurrentVideoDriver()) != "wayland"; }

void SetIcon(SDL_Window* window, const CBitmap& icon) {
  std::vector<Pixel> pixels = icon.Pixels();
  const Size size = icon.GetSize();
  SDL_Surface* surface = SDL_CreateRGBSurfaceWithFormatFrom(
      pixels.data(), size.width, size.height, 32, size.width * 4, SDL_PIXELFORMAT_ARGB8888);
  if (surface == nullptr) return;
  SDL_SetWindowIcon(window, surface);
  SDL_FreeSurface(surface);
}

void DrawScaled(const CBitmap& frame, const Rect& place, const SDL_Surface& canvas) {
  const int width = place.Width();
  ScaleFrame(frame, {width, place.Height()}, [&](int y, const std::vector<Pixel>& row) {
    const std::ptrdiff_t down = place.top + y;
    const std::ptrdiff_t across = place.left;
    auto* line = static_cast<Uint8*>(canvas.pixels) + down * canvas.pitch +
                 across * canvas.format->BytesPerPixel;
    SDL_ConvertPixels(width, 1, SDL_PIXELFORMAT_ARGB8888, row.data(), width * 4,
                      canvas.format->format, line, canvas.pitch);
  });
}

}  // namespace

SdlWindow::SdlWindow(Size frameSize) : m_frameSize(frameSize) {
  m_bOpen = Open(true) || Open(false);
  if (m_bOpen) m_rcAsked = m_rcNormal = CurrentRect();
}

SdlWindow::~SdlWindow() { Close(); }

bool SdlWindow::Open(bool plain) {
  Close();
  SdlCanvas::Prepare(plain);
  const Size size = ComfortableSize(m_frameSize);
  m_pWindow =
      SDL_CreateWindow("", SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED, size.width, size.height,
                       SDL_WINDOW_HIDDEN | SDL_WINDOW_RESIZABLE | SDL_WINDOW_ALLOW_HIGHDPI);
  if (m_pWindow == nullptr) return false;
  SDL_SetWindowMinimumSize(m_pWindow, m_frameSize.width / 2, m_frameSize.height / 2);
  if (!m_canvas.Open(m_pWindow, plain)) return false;
  // A sharp display has a larger multiple of its own that may fill a little less.
  const SDL_Rect picture = WindowRect(RectAt({}, m_frameSize));
  SDL_SetWindowSize(m_pWindow, picture.w, picture.h);
  return true;
}

void SdlWindow::Close() {
  m_canvas.Close();
  if (m_pWindow != nullptr) SDL_DestroyWindow(m_pWindow);
  m_pWindow = nullptr;
}

void SdlWindow::SetIdentity(const std::string& title, const std::optional<CBitmap>& icon) {
  SDL_SetWindowTitle(m_pWindow, title.c_str());
  if (icon) SetIcon(m_pWindow, *icon);
}

Rect SdlWindow::CurrentRect() const {
  Point at;
  Size size;
  if (KnowsPlaces()) SDL_GetWindowPosition(m_pWindow, &at.x, &at.y);
  SDL_GetWindowSize(m_pWindow, &size.width, &size.height);
  return RectAt(at, size);
}

void SdlWindow::PutAt(const Rect& rect) {
  SDL_SetWindowSize(m_pWindow, rect.Width(), rect.Height());
  SDL_SetWindowPosition(m_pWindow, rect.left, rect.top);
  // Some window managers put their title bar there.
  const Point at = rect.TopLeft() + rect.TopLeft() - CurrentRect().TopLeft();
  if (at != rect.TopLeft()) SDL_SetWindowPosition(m_pWindow, at.x, at.y);
}

/// Whoever leaves a window under a panel finds it there again: desktops have one measure for the
/// panels of all displays. One that must be moved stands clear of them.
Rect SdlWindow::OnDesktop(const Rect& rect) const {
  const auto onto = [this, &rect](Bounds* boundsOf) {
    std::vector<Rect> displays = Displays(boundsOf);
    for (Rect& display : displays) display = StillThere(m_pWindow, display);
    return MovedOnto(displays, rect);
  };
  return onto(SDL_GetDisplayBounds) == rect ? rect : onto(SDL_GetDisplayUsableBounds);
}

void SdlWindow::SetPlace(const WindowPlace& place) {
  m_bPlaced = true;
  m_rcAsked = OnDesktop(place.rect);
  PutAt(m_rcAsked);
  m_bOpensMaximized = place.maximized;
}

/// A window manager counts the title bar when it is told where to open a window, and not when it
/// says where the window is. Without a look at that the window would wander from run to run.
std::optional<WindowPlace> SdlWindow::GetPlace() const {
  const bool moved = m_rcNormal != m_rcOpened;
  if (!m_bPlaced && !moved && !IsMaximized()) return std::nullopt;
  const Point bar = m_rcOpened.TopLeft() - m_rcAsked.TopLeft();
  return WindowPlace{moved ? m_rcNormal.Moved(Point{} - bar) : m_rcAsked, IsMaximized()};
}

void SdlWindow::Show(const CBitmap& frame) {
  m_frame = frame;
  m_bStale = true;
  if (!m_bShown) Appear();
  Settle();
}

void SdlWindow::Appear() {
  m_bShown = true;
  SDL_ShowWindow(m_pWindow);
  SDL_PumpEvents();
  m_rcOpened = CurrentRect();
  const Rect inside = OnDesktop(m_rcOpened);
  if (inside != m_rcOpened) PutAt(inside);
  m_rcNormal = CurrentRect();
  if (m_bOpensMaximized) SDL_MaximizeWindow(m_pWindow);
}

void SdlWindow::OnWindowEvent(const SDL_WindowEvent& event) {
  m_bStale = m_bStale || event.event == SDL_WINDOWEVENT_EXPOSED ||
             event.event == SDL_WINDOWEVENT_SIZE_CHANGED;
}

void SdlWindow::Settle() {
  if (!m_bShown) return;
  if (m_bStale) Draw();
  if (!IsFullScreen() && !IsMaximized()) m_rcNormal = CurrentRect();
}

void SdlWindow::Draw() {
  SDL_Surface* canvas = m_canvas.Begin();
  if (canvas == nullptr) return;
  const FrameFit fit(m_frameSize, {canvas->w, canvas->h});
  if (fit.Place() != RectAt({}, {canvas->w, canvas->h})) {
    SDL_FillRect(canvas, nullptr, SDL_MapRGB(canvas->format, kSurround, kSurround, kSurround));
  }
  DrawScaled(m_frame, fit.Place(), *canvas);
  m_canvas.End();
  m_bStale = false;
}

bool SdlWindow::IsFullScreen() const {
  return m_bFillsDisplay || (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_FULLSCREEN) != 0;
}

bool SdlWindow::IsMaximized() const {
  return IsFullScreen() ? m_bMaximizedBefore
                        : (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_MAXIMIZED) != 0;
}

int SdlWindow::BarHeight() const {
  const int height = m_rcOpened.top - m_rcAsked.top;
  return height > 0 && height <= 2 * kTitleBar ? height : 0;
}

void SdlWindow::ToggleFullScreen() {
  if (IsFullScreen()) {
    LeaveFullScreen();
  } else {
    EnterFullScreen();
  }
}

void SdlWindow::EnterFullScreen() {
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

/// The display may have become smaller meanwhile.
void SdlWindow::LeaveFullScreen() {
  const Rect display = CurrentRect();
  Rect back = m_rcNormal;
  back.top -= BarHeight();
  back = OnDesktop(back);
  back.top += BarHeight();
  if (!m_bFillsDisplay) SDL_SetWindowFullscreen(m_pWindow, 0);
  m_bFillsDisplay = false;
  if (m_bMaximizedBefore) {
    SDL_MaximizeWindow(m_pWindow);
  } else if (back != m_rcNormal || SizeOf(CurrentRect()) == SizeOf(display)) {
    PutAt(back);
  }
}

Size SdlWindow::SizeInPixels() const {
  Size size{1, 1};
  SDL_GetWindowSizeInPixels(m_pWindow, &size.width, &size.height);
  return size;
}

Point SdlWindow::FramePoint(Point at) const {
  const Size window = SizeOf(CurrentRect());
  const Size pixels = SizeInPixels();
  // The pixel under the middle of the place.
  const Point pixel{(2 * at.x + 1) * pixels.width / (2 * window.width),
                    (2 * at.y + 1) * pixels.height / (2 * window.height)};
  return FrameFit(m_frameSize, pixels).FramePoint(pixel);
}

SDL_Rect SdlWindow::WindowRect(const Rect& pixels) const {
  const Size window = SizeOf(CurrentRect());
  const Size all = SizeInPixels();
  const Rect seen = FrameFit(m_frameSize, all).RoomRect(pixels);
  return {seen.left * window.width / all.width, seen.top * window.height / all.height,
          seen.Width() * window.width / all.width, seen.Height() * window.height / all.height};
}

}  // namespace platform
