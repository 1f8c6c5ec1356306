#pragma once

#include <vector>

#include "platform/window/top_window.h"

namespace platform {

/// The program's window as a stack of top-level windows, the frame at the bottom. It lays their
/// pixels over one another and hands input to the right one.
class CScreen {
 public:
  /// A screen of so many pixels; it never changes.
  explicit CScreen(Size size) : m_size(size) {}
  Size GetSize() const { return m_size; }

  /// Bottom to top.
  const std::vector<CTopWindow*>& Windows() const { return m_arrWindows; }
  /// Null while no window is open.
  CTopWindow* Top() const { return m_arrWindows.empty() ? nullptr : m_arrWindows.back(); }
  /// For CTopWindow::Open and Close. Whoever has the pointer loses it to a window that opens.
  void Push(CTopWindow& window);
  void Remove(CTopWindow& window);

  /// Keys, texts and the wheel go to the topmost window only, a press to whatever lies there;
  /// nothing to one that is disabled.
  void HandleInput(const InputEvent& event);
  /// Hands the pointer that is down over to another window until it is released.
  void Capture(CWindow& window) { m_pPressed = &window; }

  /// Something on a top-level window or in the stack has changed.
  void MarkStale() { m_bStale = true; }
  /// Paints what needs it, and a tool tip that is due.
  void PaintAll();
  /// Shows the stack if it has changed since it was last shown.
  void Present();

  /// The tool tip that is shown; empty for none.
  std::string TipText() const { return m_toolTip.GetText(); }
  /// Milliseconds until a tool tip is due; below 0 where none is pending.
  int TimeToTip() const { return m_toolTip.TimeLeft(); }

  /// A window is being disabled or hidden: a press that it or a child of it has is lost.
  void TakePressFrom(const CWindow& window);
  /// The window is about to be destroyed.
  void Forget(CWindow& window);

 private:
  void PressAt(Point at);
  void MoveTo(Point at);
  void ReleaseAt(Point at);
  bool IsTopEnabled() const { return Top() != nullptr && Top()->IsEnabled(); }
  /// What the topmost window takes, and it alone.
  void HandleByTop(const InputEvent& event);
  void TipFor(const ToolTip& tip);
  void DismissTip();
  /// Whoever has the pointer has it no more, without a release.
  void LosePress();
  CTopWindow* WindowUnder(Point at) const;

  Size m_size;
  std::vector<CTopWindow*> m_arrWindows;
  CToolTipCtrl m_toolTip;
  CBitmap m_composed;  ///< what is shown, while it is more than the frame
  bool m_bStale = true;
  CWindow* m_pPressed = nullptr;  ///< has the pointer until it is released
  bool m_bDown = false;           ///< the pointer, which hovers over nothing then
};

}  // namespace platform
