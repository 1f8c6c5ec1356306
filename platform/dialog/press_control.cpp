#include "platform/dialog/press_control.h"

namespace platform {

void CPressControl::OnLButtonDown(Point) {
  TakeFocus();
  m_bPressed = true;
  Invalidate();
}

void CPressControl::OnMouseMove(Point p) {
  const bool inside = GetClientRect().Contains(p);
  if (m_bPressed == inside) return;
  m_bPressed = inside;
  Invalidate();
}

void CPressControl::OnPressLost() {
  m_bPressed = false;
  Invalidate();
}

void CPressControl::OnLButtonUp(Point p) {
  m_bPressed = false;
  Invalidate();
  if (GetClientRect().Contains(p)) Activate();
}

}  // namespace platform
