#pragma once

#include <SDL.h>

#include <optional>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/host/window_place.h"

namespace platform {

/// The desktop window: it keeps the last picture and shows it sharp, at the largest whole multiple
/// that the window has room for, in the middle.
class SdlWindow {
 public:
  explicit SdlWindow(Size frameSize);
  ~SdlWindow();
  SdlWindow(const SdlWindow&) = delete;
  SdlWindow& operator=(const SdlWindow&) = delete;

  /// Whether there is something to draw on.
  bool IsOpen() const { return m_pTexture != nullptr; }
  void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon);
  /// Before the first picture is shown.
  void SetPlace(const WindowPlace& place);
  WindowPlace GetPlace() const;
  void Show(const CBitmap& frame);
  /// Shows the last picture again.
  void Refresh();
  void ToggleFullScreen();
  /// The pixel of the picture under a place in window coordinates; may lie beside the picture.
  Point FramePoint(int x, int y) const;
  /// Pixels of the picture in window coordinates.
  SDL_Rect WindowRect(const Rect& pixels) const;

 private:
  bool Open(bool plain);
  void Release();
  int ComfortableMultiple() const;
  /// Where the picture stands in the window's own pixels.
  SDL_Rect FramePlace() const;

  Size m_frameSize;
  SDL_Window* m_pWindow = nullptr;
  SDL_Renderer* m_pRenderer = nullptr;
  SDL_Texture* m_pTexture = nullptr;
  bool m_bShown = false;
};

}  // namespace platform
