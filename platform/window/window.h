#pragma once

#include <string>
#include <vector>

#include "platform/draw/surface.h"
#include "platform/host/input.h"
#include "platform/window/tool_tip.h"

namespace platform {

class CTopWindow;

/// A rectangle of the screen that paints itself and takes input. Places in its handlers are pixels
/// of its own client area, whose top-left corner is (0, 0).
///
/// A window does not own its children: each belongs to whoever declared it, and leaves its parent
/// when it is destroyed.
class CWindow {
 public:
  /// A window at a place in its parent's pixels; a window without parent is a top-level one, at a
  /// place on the screen.
  CWindow(CWindow* parent, const Rect& place);
  virtual ~CWindow();
  CWindow(const CWindow&) = delete;
  CWindow& operator=(const CWindow&) = delete;

  /// Null for a top-level window.
  CWindow* GetParent() const { return m_pParent; }
  CTopWindow& TopLevel();

  /// In its parent's pixels, or on the screen.
  const Rect& GetPlace() const { return m_rcPlace; }
  /// Moves it within its parent. A top-level window keeps its size, and the screen must be told.
  void SetPlace(const Rect& place);
  Rect GetClientRect() const { return RectAt({}, {m_rcPlace.Width(), m_rcPlace.Height()}); }
  /// Where the client area's corner stands on the screen.
  Point ScreenOrigin() const;

  bool IsVisible() const { return m_bVisible; }
  /// A press that a window has is lost when it is hidden.
  void ShowWindow(bool visible);
  /// A disabled window takes no input; neither do its children. A press that one of them has is
  /// lost.
  bool IsEnabled() const { return m_bEnabled; }
  void EnableWindow(bool enabled);

  /// Marks the whole client area as in need of painting, background included.
  void Invalidate();
  /// Paints what needs it, now, and shows it before it returns.
  void UpdateWindow();

  /// The visible, enabled window under a place: a child, a child's child, or this one.
  CWindow& WindowAt(Point p);

  /// Paints the background and returns true; false leaves it to the common face.
  virtual bool OnEraseBkgnd(CSurface&) { return false; }
  virtual void OnPaint(CSurface&) {}
  virtual void OnLButtonDown(Point) {}
  /// While the button or stylus that went down in this window is down; may lie outside of it.
  virtual void OnMouseMove(Point) {}
  virtual void OnLButtonUp(Point) {}
  /// While a mouse moves with nothing down, in the topmost window; beside it too.
  virtual void OnMouseHover(Point) {}
  /// What is said of the tool at a place, to a mouse that rests there.
  virtual ToolTip TipAt(Point) const { return {}; }
  /// The press that this window had is over without a release: it was disabled or hidden meanwhile,
  /// or another window opened.
  virtual void OnPressLost() {}
  /// In notches, away from the person is positive.
  virtual void OnMouseWheel(int) {}
  /// The middle button went down on this window; the text is what is marked on the desktop.
  virtual void OnMiddleClick(Point, const std::string&) {}
  /// Answers whether the key meant something here; otherwise the parent is asked.
  virtual bool OnKeyDown(const KeyStroke&) { return false; }
  /// Typed text in UTF-8, one letter or several; returns as OnKeyDown does.
  virtual bool OnChar(const std::string&) { return false; }
  /// What an input method has not finished yet, each time it changes; empty: it is done with it.
  virtual bool OnComposition(const std::string&) { return false; }
  /// The keyboard has come here or gone.
  virtual void OnFocus(bool) { Invalidate(); }

 private:
  friend class CTopWindow;
  /// Paints itself and its children where needed onto the top-level window's pixels; returns
  /// whether anything was.
  bool PaintInto(CBitmap& pixels, Point origin, bool force);

  CWindow* m_pParent;
  std::vector<CWindow*> m_arrChildren;
  Rect m_rcPlace;
  bool m_bVisible = true;
  bool m_bEnabled = true;
  bool m_bInvalid = true;
};

}  // namespace platform
