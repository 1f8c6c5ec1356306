#include "platform/host/sdl_window.h"

#include <cstddef>

#include "platform/host/frame_fit.h"
#include "platform/host/frame_scaling.h"

namespace platform {
namespace {

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

void DrawScaled(const CBitmap& frame, const Rect& place, const SDL_Surface& canvas) {
  const std::ptrdiff_t pitch = canvas.pitch;
  const std::ptrdiff_t pixelSize = canvas.format->BytesPerPixel;
  auto* corner = static_cast<Uint8*>(canvas.pixels) + pitch * place.top + pixelSize * place.left;
  const int width = place.Width();
  ScaleFrame(frame, {width, place.Height()}, [&](int y, const std::vector<Pixel>& row) {
    SDL_ConvertPixels(width, 1, SDL_PIXELFORMAT_ARGB8888, row.data(), width * 4,
                      canvas.format->format, corner + pitch * y, canvas.pitch);
  });
}

}  // namespace

SdlWindow::SdlWindow(Size frameSize) : m_frameSize(frameSize) {
  if (Open(true) || Open(false)) m_placement.emplace(m_pWindow);
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

void SdlWindow::Show(const CBitmap& frame) {
  m_bStale = true;
  if (m_pFrame == nullptr) m_placement->Show();
  m_pFrame = &frame;
  Settle();
}

void SdlWindow::OnWindowEvent(const SDL_WindowEvent& event) {
  m_bStale = m_bStale || event.event == SDL_WINDOWEVENT_EXPOSED ||
             event.event == SDL_WINDOWEVENT_SIZE_CHANGED;
}

void SdlWindow::Settle() {
  if (m_pFrame == nullptr) return;
  if (m_bStale) Draw();
  m_placement->Settle();
}

void SdlWindow::Draw() {
  SDL_Surface* canvas = m_canvas.Begin();
  if (canvas == nullptr) return;
  const FrameFit fit(m_frameSize, {canvas->w, canvas->h});
  if (fit.Place() != RectAt({}, {canvas->w, canvas->h})) {
    SDL_FillRect(canvas, nullptr, SDL_MapRGB(canvas->format, kSurround, kSurround, kSurround));
  }
  DrawScaled(*m_pFrame, fit.Place(), *canvas);
  m_canvas.End();
  m_bStale = false;
}

Size SdlWindow::GetSize() const {
  Size size{1, 1};
  SDL_GetWindowSize(m_pWindow, &size.width, &size.height);
  return size;
}

Size SdlWindow::SizeInPixels() const {
  Size size{1, 1};
  SDL_GetWindowSizeInPixels(m_pWindow, &size.width, &size.height);
  return size;
}

Point SdlWindow::FramePoint(Point at) const {
  const Size window = GetSize();
  const Size pixels = SizeInPixels();
  // The pixel under the middle of the place.
  const Point pixel{(2 * at.x + 1) * pixels.width / (2 * window.width),
                    (2 * at.y + 1) * pixels.height / (2 * window.height)};
  return FrameFit(m_frameSize, pixels).FramePoint(pixel);
}

SDL_Rect SdlWindow::WindowRect(const Rect& pixels) const {
  const Size window = GetSize();
  const Size all = SizeInPixels();
  const Rect seen = FrameFit(m_frameSize, all).RoomRect(pixels);
  return {seen.left * window.width / all.width, seen.top * window.height / all.height,
          seen.Width() * window.width / all.width, seen.Height() * window.height / all.height};
}

}  // namespace platform
