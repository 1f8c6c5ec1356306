#include "platform/window/top_window.h"

#include <utility>

#include "platform/window/application.h"

namespace platform {

CTopWindow::CTopWindow(std::string title, const Rect& place, Kind kind)
    : CWindow(nullptr, place),
      m_strTitle(std::move(title)),
      m_eKind(kind),
      m_pixels({place.Width(), place.Height()}) {}

CTopWindow::~CTopWindow() { Close(); }

void CTopWindow::Open() { TheApp().Screen().Push(*this); }

void CTopWindow::Close() {
  TheApp().Screen().Remove(*this);
  TheApp().TellAnew();  // whoever comes back to a window may have forgotten it
}

void CTopWindow::PaintIfNeeded() {
  if (PaintInto(m_pixels, {}, false)) TheApp().Screen().MarkStale();
}

void CTopWindow::SetFocus(CWindow* child) {
  if (m_pFocus == child) return;
  CWindow* previous = std::exchange(m_pFocus, child);
  if (previous != nullptr) previous->OnFocus(false);
  if (m_pFocus != nullptr) m_pFocus->OnFocus(true);
}

template <class Handler>
bool CTopWindow::Route(Handler handler) {
  for (CWindow* window = m_pFocus != nullptr ? m_pFocus : this; window != nullptr;
       window = window->GetParent()) {
    if (handler(*window)) return true;
  }
  return false;
}

bool CTopWindow::RouteKey(const KeyStroke& stroke) {
  return Route([&stroke](CWindow& window) { return window.OnKeyDown(stroke); });
}

bool CTopWindow::RouteText(const std::string& text) {
  return Route([&text](CWindow& window) { return window.OnChar(text); });
}

bool CTopWindow::RouteComposition(const std::string& text) {
  return Route([&text](CWindow& window) { return window.OnComposition(text); });
}

void CTopWindow::Forget(CWindow& child) {
  if (m_pFocus == &child) m_pFocus = nullptr;
  TheApp().Screen().Forget(child);
}

}  // namespace platform
