#pragma once

#include <SDL.h>

#include <optional>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/host/sdl_canvas.h"
#include "platform/host/sdl_placement.h"

namespace platform {

/// The desktop window: it keeps the last picture and shows it in whatever room the desktop gives
/// it. Places in it are in SDL's window coordinates, of which a sharp display has several pixels
/// each.
class SdlWindow {
 public:
  explicit SdlWindow(Size frameSize);
  ~SdlWindow();
  SdlWindow(const SdlWindow&) = delete;
  SdlWindow& operator=(const SdlWindow&) = delete;

  /// Whether there is something to draw on.
  bool IsOpen() const { return m_placement.has_value(); }
  void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon);

  SdlPlacement& Placement() { return *m_placement; }

  void Show(const CBitmap& frame);
  /// Takes note that the desktop wants the picture again, or has put the window elsewhere.
  void OnWindowEvent(const SDL_WindowEvent& event);
  /// Does what events left to be done, once for all of them.
  void Settle();

  /// The pixel of the picture under a place; may lie beside the picture.
  Point FramePoint(Point at) const;
  /// Where pixels of the picture are seen.
  SDL_Rect WindowRect(const Rect& pixels) const;

 private:
  bool Open(bool plain);
  void Close();
  Size GetSize() const;
  Size SizeInPixels() const;
  void Draw();

  Size m_frameSize;
  const CBitmap* m_pFrame = nullptr;  ///< the last that was shown
  SDL_Window* m_pWindow = nullptr;
  SdlCanvas m_canvas;
  std::optional<SdlPlacement> m_placement;  ///< of an open window
  bool m_bStale = false;  ///< the desktop does not show the picture as it should be
};

}  // namespace platform
