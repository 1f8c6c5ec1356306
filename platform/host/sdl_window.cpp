#include "platform/host/sdl_window.h"

#include <algorithm>
#include <cmath>

namespace platform {
namespace {

/// The share of the desktop's room that a window may take and still feel comfortable, in percent.
constexpr int kComfortableShare = 90;

/// The colour around a picture that does not fill the window.
constexpr Uint8 kSurround = 32;

void SetIcon(SDL_Window* window, const CBitmap& icon) {
  std::vector<Pixel> pixels = icon.Pixels();
  const Size size = icon.GetSize();
  SDL_Surface* surface = SDL_CreateRGBSurfaceWithFormatFrom(
      pixels.data(), size.width, size.height, 32, size.width * 4, SDL_PIXELFORMAT_ARGB8888);
  if (surface == nullptr) return;
  SDL_SetWindowIcon(window, surface);
  SDL_FreeSurface(surface);
}

int FloorDivide(int value, int by) {
  return static_cast<int>(std::floor(static_cast<double>(value) / by));
}

}  // namespace

SdlWindow::SdlWindow(Size frameSize) : m_frameSize(frameSize) {
  if (!Open(true)) Open(false);
}

SdlWindow::~SdlWindow() { Release(); }

/// Plain is quickest and smallest: pixels in memory, handed to the desktop as they are. Displays
/// without such a path take what SDL thinks best.
bool SdlWindow::Open(bool plain) {
  Release();
  if (plain) {
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    SDL_SetHint(SDL_HINT_RENDER_DRIVER, "software");
  } else {
    SDL_ResetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION);
    SDL_ResetHint(SDL_HINT_RENDER_DRIVER);
  }
  SDL_SetHint(SDL_HINT_RENDER_SCALE_QUALITY, "nearest");
  const int multiple = ComfortableMultiple();
  m_pWindow = SDL_CreateWindow("", SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED,
                               m_frameSize.width * multiple, m_frameSize.height * multiple,
                               SDL_WINDOW_HIDDEN | SDL_WINDOW_RESIZABLE | SDL_WINDOW_ALLOW_HIGHDPI);
  if (m_pWindow == nullptr) return false;
  SDL_SetWindowMinimumSize(m_pWindow, m_frameSize.width, m_frameSize.height);
  m_pRenderer = SDL_CreateRenderer(m_pWindow, -1, plain ? SDL_RENDERER_SOFTWARE : 0);
  if (m_pRenderer == nullptr) return false;
  m_pTexture = SDL_CreateTexture(m_pRenderer, SDL_PIXELFORMAT_ARGB8888, SDL_TEXTUREACCESS_STREAMING,
                                 m_frameSize.width, m_frameSize.height);
  return m_pTexture != nullptr;
}

void SdlWindow::Release() {
  if (m_pTexture != nullptr) SDL_DestroyTexture(m_pTexture);
  if (m_pRenderer != nullptr) SDL_DestroyRenderer(m_pRenderer);
  if (m_pWindow != nullptr) SDL_DestroyWindow(m_pWindow);
  m_pTexture = nullptr;
  m_pRenderer = nullptr;
  m_pWindow = nullptr;
}

int SdlWindow::ComfortableMultiple() const {
  SDL_Rect room{};
  if (SDL_GetDisplayUsableBounds(0, &room) != 0) return 1;
  const int across = room.w * kComfortableShare / 100 / m_frameSize.width;
  const int down = room.h * kComfortableShare / 100 / m_frameSize.height;
  return std::max(1, std::min(across, down));
}

void SdlWindow::SetIdentity(const std::string& title, const std::optional<CBitmap>& icon) {
  SDL_SetWindowTitle(m_pWindow, title.c_str());
  if (icon) SetIcon(m_pWindow, *icon);
}

void SdlWindow::SetPlace(const WindowPlace& place) {
  SDL_SetWindowPosition(m_pWindow, place.rect.left, place.rect.top);
  SDL_SetWindowSize(m_pWindow, place.rect.Width(), place.rect.Height());
  if (place.maximized) SDL_MaximizeWindow(m_pWindow);
}

WindowPlace SdlWindow::GetPlace() const {
  Point at;
  Size size;
  SDL_GetWindowPosition(m_pWindow, &at.x, &at.y);
  SDL_GetWindowSize(m_pWindow, &size.width, &size.height);
  return {RectAt(at, size), (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_MAXIMIZED) != 0};
}

void SdlWindow::Show(const CBitmap& frame) {
  SDL_UpdateTexture(m_pTexture, nullptr, frame.Pixels().data(), m_frameSize.width * 4);
  if (!m_bShown) SDL_ShowWindow(m_pWindow);
  m_bShown = true;
  Refresh();
}

void SdlWindow::Refresh() {
  if (!m_bShown) return;
  const SDL_Rect place = FramePlace();
  SDL_SetRenderDrawColor(m_pRenderer, kSurround, kSurround, kSurround, 255);
  SDL_RenderClear(m_pRenderer);
  SDL_RenderCopy(m_pRenderer, m_pTexture, nullptr, &place);
  SDL_RenderPresent(m_pRenderer);
}

void SdlWindow::ToggleFullScreen() {
  const bool full = (SDL_GetWindowFlags(m_pWindow) & SDL_WINDOW_FULLSCREEN_DESKTOP) ==
                    SDL_WINDOW_FULLSCREEN_DESKTOP;
  SDL_SetWindowFullscreen(m_pWindow, full ? 0 : SDL_WINDOW_FULLSCREEN_DESKTOP);
}

SDL_Rect SdlWindow::FramePlace() const {
  Size room = m_frameSize;
  SDL_GetRendererOutputSize(m_pRenderer, &room.width, &room.height);
  const int multiple =
      std::max(1, std::min(room.width / m_frameSize.width, room.height / m_frameSize.height));
  const int width = m_frameSize.width * multiple;
  const int height = m_frameSize.height * multiple;
  return {(room.width - width) / 2, (room.height - height) / 2, width, height};
}

Point SdlWindow::FramePoint(int x, int y) const {
  Size window{1, 1};
  Size room{1, 1};
  SDL_GetWindowSize(m_pWindow, &window.width, &window.height);
  SDL_GetRendererOutputSize(m_pRenderer, &room.width, &room.height);
  const SDL_Rect place = FramePlace();
  const int multiple = place.w / m_frameSize.width;
  const int across = x * room.width / std::max(1, window.width) - place.x;
  const int down = y * room.height / std::max(1, window.height) - place.y;
  return {FloorDivide(across, multiple), FloorDivide(down, multiple)};
}

SDL_Rect SdlWindow::WindowRect(const Rect& pixels) const {
  Size window{1, 1};
  Size room{1, 1};
  SDL_GetWindowSize(m_pWindow, &window.width, &window.height);
  SDL_GetRendererOutputSize(m_pRenderer, &room.width, &room.height);
  const SDL_Rect place = FramePlace();
  const int multiple = place.w / m_frameSize.width;
  const auto across = [&](int x) { return (place.x + x * multiple) * window.width / room.width; };
  const auto down = [&](int y) { return (place.y + y * multiple) * window.height / room.height; };
  return {across(pixels.left), down(pixels.top), across(pixels.right) - across(pixels.left),
          down(pixels.bottom) - down(pixels.top)};
}

}  // namespace platform
