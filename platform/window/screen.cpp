#include "platform/window/screen.h"

#include <algorithm>
#include <utility>

#include "platform/host/host.h"

namespace platform {

void CScreen::Push(CTopWindow& window) {
  LosePress();
  DismissTip();
  m_arrWindows.push_back(&window);
  MarkStale();
}

void CScreen::Remove(CTopWindow& window) {
  if (std::erase(m_arrWindows, &window) == 0) return;
  if (m_pPressed != nullptr && &m_pPressed->TopLevel() == &window) m_pPressed = nullptr;
  MarkStale();
}

CTopWindow* CScreen::WindowUnder(Point at) const {
  const auto found =
      std::find_if(m_arrWindows.rbegin(), m_arrWindows.rend(),
                   [at](const CTopWindow* window) { return window->GetPlace().Contains(at); });
  return found == m_arrWindows.rend() ? nullptr : *found;
}

void CScreen::LosePress() {
  if (CWindow* pressed = std::exchange(m_pPressed, nullptr); pressed != nullptr) {
    pressed->OnPressLost();
  }
}

void CScreen::PressAt(Point at) {
  CTopWindow* window = WindowUnder(at);
  if (Top() != nullptr && Top() != window && Top()->GetKind() == CTopWindow::Kind::kPopup) {
    Top()->OnPressOutside();
    return;
  }
  if (window == nullptr || !window->IsEnabled()) return;
  LosePress();
  CWindow& pressed = window->WindowAt(at - window->GetPlace().TopLeft());
  m_pPressed = &pressed;
  pressed.OnLButtonDown(at - pressed.ScreenOrigin());
}

void CScreen::MoveTo(Point at) {
  if (m_pPressed != nullptr) return m_pPressed->OnMouseMove(at - m_pPressed->ScreenOrigin());
  if (m_bDown || !IsTopEnabled()) return;
  CWindow& window = Top()->WindowAt(at - Top()->GetPlace().TopLeft());
  const Point origin = window.ScreenOrigin();
  window.OnMouseHover(at - origin);
  const ToolTip tip = window.TipAt(at - origin);
  TipFor({tip.text, tip.tool.Moved(origin)});
}

void CScreen::ReleaseAt(Point at) {
  CWindow* pressed = std::exchange(m_pPressed, nullptr);
  if (pressed != nullptr) pressed->OnLButtonUp(at - pressed->ScreenOrigin());
}

void CScreen::TipFor(const ToolTip& tip) {
  if (m_toolTip.Hover(tip)) MarkStale();
}

void CScreen::DismissTip() {
  if (m_toolTip.Dismiss()) MarkStale();
}

void CScreen::HandleInput(const InputEvent& event) {
  const bool moves =
      event.kind == InputKind::kPointerMove || event.kind == InputKind::kPointerLeave;
  if (!moves) DismissTip();
  if (event.kind == InputKind::kPointerDown) m_bDown = true;
  if (event.kind == InputKind::kPointerUp) m_bDown = false;
  switch (event.kind) {
    case InputKind::kPointerDown:
      return PressAt(event.at);
    case InputKind::kPointerMove:
      return MoveTo(event.at);
    case InputKind::kPointerUp:
      return ReleaseAt(event.at);
    case InputKind::kPointerLeave:
      return TipFor({});
    default:
      if (IsTopEnabled()) HandleByTop(event);
  }
}

void CScreen::HandleByTop(const InputEvent& event) {
  CTopWindow& top = *Top();
  CWindow& under = top.WindowAt(event.at - top.GetPlace().TopLeft());
  switch (event.kind) {
    case InputKind::kWheel:
      if (WindowUnder(event.at) == &top) under.OnMouseWheel(event.wheel);
      break;
    case InputKind::kMiddleClick:
      if (WindowUnder(event.at) == &top) {
        under.OnMiddleClick(event.at - under.ScreenOrigin(), event.text);
      }
      break;
    case InputKind::kKey:
      top.RouteKey(event.stroke);
      break;
    case InputKind::kText:
      top.RouteText(event.text);
      break;
    case InputKind::kComposition:
      top.RouteComposition(event.text);
      break;
    default:
      break;
  }
}

void CScreen::PaintAll() {
  for (CTopWindow* window : m_arrWindows) window->PaintIfNeeded();
  if (m_toolTip.ShowWhenDue()) MarkStale();
}

void CScreen::Present() {
  if (!m_bStale || m_arrWindows.empty()) return;
  m_bStale = false;
  const CBitmap& whole = Top()->Pixels();
  // The frame alone needs no other picture than its own.
  const bool alone = m_arrWindows.size() == 1 && TipText().empty();
  if (alone && whole.GetSize() == m_size) {
    TheHost().Show(whole);
    m_composed = {};
    return;
  }
  if (m_composed.GetSize() != m_size) m_composed = CBitmap(m_size);
  CSurface surface(m_composed);
  surface.FillRect(surface.Bounds(), kBlack);
  for (const CTopWindow* window : m_arrWindows) {
    surface.BitBlt(window->GetPlace().TopLeft(), window->Pixels().GetSize(), window->Pixels());
  }
  m_toolTip.Draw(surface);
  TheHost().Show(m_composed);
}

void CScreen::TakePressFrom(const CWindow& window) {
  for (const CWindow* at = m_pPressed; at != nullptr; at = at->GetParent()) {
    if (at != &window) continue;
    return LosePress();
  }
}

void CScreen::Forget(CWindow& window) {
  if (m_pPressed == &window) m_pPressed = nullptr;
}

}  // namespace platform
