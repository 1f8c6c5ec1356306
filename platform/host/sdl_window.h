#pragma once

#include <SDL.h>

#include <optional>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/host/frame_fit.h"
#include "platform/host/sdl_canvas.h"
#include "platform/host/window_place.h"

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
  bool IsOpen() const { return m_bOpen; }
  void SetIdentity(const std::string& title, const std::optional<CBitmap>& icon);

  /// Before the first picture is shown; a place that has left the desktop is moved onto it.
  void SetPlace(const WindowPlace& place);
  /// Nothing where neither SetPlace nor the person has put the window anywhere.
  std::optional<WindowPlace> GetPlace() const;

  void Show(const CBitmap& frame);
  /// Takes note that the desktop wants the picture again, or has put the window elsewhere.
  void OnWindowEvent(const SDL_WindowEvent& event);
  /// Does what events left to be done, once for all of them.
  void Settle();

  /// Fills the display or goes back, also on desktops that know no such thing.
  void ToggleFullScreen();
  /// The pixel of the picture under a place; may lie beside the picture.
  Point FramePoint(Point at) const;
  /// Where pixels of the picture are seen.
  SDL_Rect WindowRect(const Rect& pixels) const;

 private:
  bool Open(bool plain);
  void Close();
  /// Is seen for the first time.
  void Appear();
  Rect CurrentRect() const;
  /// The nearest place on a display that is there now.
  Rect OnDesktop(const Rect& rect) const;
  /// Of the window manager's bar above the window; 0 where none can be told.
  int BarHeight() const;
  void PutAt(const Rect& rect);
  bool IsFullScreen() const;
  /// In full screen: whether it was before.
  bool IsMaximized() const;
  void EnterFullScreen();
  void LeaveFullScreen();
  Size SizeInPixels() const;
  void Draw();

  Size m_frameSize;
  CBitmap m_frame;
  SDL_Window* m_pWindow = nullptr;
  SdlCanvas m_canvas;
  bool m_bOpen = false;
  bool m_bShown = false;
  bool m_bStale = false;         ///< the desktop does not show the picture as it should be
  bool m_bFillsDisplay = false;  ///< by its size alone, as the desktop knows no full screen
  bool m_bPlaced = false;        ///< by SetPlace
  bool m_bOpensMaximized = false;
  bool m_bMaximizedBefore = false;  ///< before it filled the display
  Rect m_rcAsked;                   ///< where the window was to open
  Rect m_rcOpened;                  ///< where the desktop then put it
  Rect m_rcNormal;  ///< where it last stood, neither maximised nor filling the display
};

}  // namespace platform
