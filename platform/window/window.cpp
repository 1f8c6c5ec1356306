#include "platform/window/window.h"

#include <algorithm>

#include "platform/draw/look.h"
#include "platform/window/application.h"
#include "platform/window/top_window.h"

namespace platform {

CWindow::CWindow(CWindow* parent, const Rect& place) : m_pParent(parent), m_rcPlace(place) {
  if (m_pParent != nullptr) m_pParent->m_arrChildren.push_back(this);
}

CWindow::~CWindow() {
  for (CWindow* child : m_arrChildren) child->m_pParent = nullptr;
  if (m_pParent == nullptr) return;
  TopLevel().Forget(*this);
  auto& siblings = m_pParent->m_arrChildren;
  siblings.erase(std::remove(siblings.begin(), siblings.end(), this), siblings.end());
}

CTopWindow& CWindow::TopLevel() {
  CWindow* window = this;
  while (window->m_pParent != nullptr) window = window->m_pParent;
  return static_cast<CTopWindow&>(*window);
}

void CWindow::SetPlace(const Rect& place) {
  m_rcPlace = place;
  if (m_pParent != nullptr) m_pParent->Invalidate();
}

Point CWindow::ScreenOrigin() const {
  const Point origin = m_rcPlace.TopLeft();
  return m_pParent == nullptr ? origin : origin + m_pParent->ScreenOrigin();
}

void CWindow::ShowWindow(bool visible) {
  if (m_bVisible == visible) return;
  m_bVisible = visible;
  if (!visible) TheApp().Screen().TakePressFrom(*this);
  if (m_pParent != nullptr) m_pParent->Invalidate();
}

void CWindow::EnableWindow(bool enabled) {
  if (m_bEnabled == enabled) return;
  m_bEnabled = enabled;
  if (!enabled) TheApp().Screen().TakePressFrom(*this);
  Invalidate();
}

void CWindow::Invalidate() { m_bInvalid = true; }

void CWindow::UpdateWindow() {
  TopLevel().PaintIfNeeded();
  TheApp().Screen().Present();
}

CWindow& CWindow::WindowAt(Point p) {
  for (auto child = m_arrChildren.rbegin(); child != m_arrChildren.rend(); ++child) {
    CWindow& window = **child;
    if (window.m_bVisible && window.m_bEnabled && window.m_rcPlace.Contains(p)) {
      return window.WindowAt(p - window.m_rcPlace.TopLeft());
    }
  }
  return *this;
}

bool CWindow::PaintInto(CBitmap& pixels, Point origin, bool force) {
  const bool needed = force || m_bInvalid;
  if (needed) {
    m_bInvalid = false;
    CSurface surface(pixels, GetClientRect().Moved(origin));
    if (!OnEraseBkgnd(surface)) surface.FillRect(surface.Bounds(), kFaceColor);
    OnPaint(surface);
  }
  bool painted = needed;
  for (CWindow* child : m_arrChildren) {
    if (!child->m_bVisible) continue;
    painted = child->PaintInto(pixels, origin + child->m_rcPlace.TopLeft(), needed) || painted;
  }
  return painted;
}

}  // namespace platform
