#pragma once

#include <SDL.h>

#include <optional>

#include "platform/host/window_place.h"

namespace platform {

/// The size of a window for a picture that feels comfortable on the desktop when it opens.
Size ComfortableSize(Size frame);

/// Where a window stands on the desktop: it opens where it is asked to, on a display that is there,
/// fills the display and comes back. Places are those of its inside, without what a window manager
/// puts around it.
class SdlPlacement {
 public:
  /// The window, which must outlive this, is not shown yet.
  explicit SdlPlacement(SDL_Window* window);

  /// Asks for a place; one that has left the desktop is moved onto it.
  void Ask(const WindowPlace& place);
  void Show();
  /// Looks where the window is now, once its events are done.
  void Settle();
  /// Nothing where it is neither asked for nor where the person has put the window.
  std::optional<WindowPlace> Place() const;

  /// Fills the display or goes back, also on desktops that know no such thing.
  void ToggleFullScreen();

 private:
  Rect CurrentRect() const;
  /// The nearest place on a display that is there now.
  Rect OnDesktop(const Rect& rect) const;
  /// The same for a window that stands below the window manager's bar.
  Rect OnDesktopWithBar(Rect inside) const;
  void PutAt(const Rect& rect);
  bool IsFullScreen() const;
  /// In full screen: whether it was before.
  bool IsMaximized() const;
  /// Of the window manager's bar above the window; 0 where none can be told.
  int BarHeight() const;
  void EnterFullScreen();
  void LeaveFullScreen();

  SDL_Window* m_pWindow;
  Rect m_rcAsked;   ///< where the window was to open
  Rect m_rcOpened;  ///< where the desktop then put it
  Rect m_rcNormal;  ///< where it last stood, neither maximised nor filling the display
  bool m_bAsked = false;
  bool m_bOpensMaximized = false;
  bool m_bMaximizedBefore = false;  ///< before it filled the display
  bool m_bFillsDisplay = false;     ///< by its size alone, as the desktop knows no full screen
};

}  // namespace platform
