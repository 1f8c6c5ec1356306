#include "platform/window/command_bar.h"

#include <algorithm>
#include <utility>

#include "platform/draw/look.h"
#include "platform/window/application.h"
#include "platform/window/frame_window.h"

namespace platform {
namespace {

constexpr int kTop = 2;
constexpr int kTitlePadding = 4;
constexpr Size kButtonSize{24, 22};
constexpr int kSeparatorWidth = 5;
constexpr Size kCloseSize{18, 16};

/// A part of a picture, see-through pixels included.
CBitmap CutOut(const CBitmap& picture, const Rect& part) {
  CBitmap cut = CBitmap::SeeThrough({part.Width(), part.Height()});
  CSurface(cut).DrawIcon(Point{} - part.TopLeft(), picture);
  return cut;
}

}  // namespace

CCommandBar::CCommandBar(CWindow* frame, const Rect& place) : CWindow(frame, place) {}

void CCommandBar::InsertMenuBar(const MenuTemplate& menu) {
  m_menu = menu;
  const int width = MeasureText(kSystemFont, WithoutMnemonic(menu.title)).width;
  m_rcTitle = RectAt({2, kTop}, {width + 2 * kTitlePadding, kButtonSize.height});
}

void CCommandBar::AddAdornments() {
  const Rect client = GetClientRect();
  m_rcClose = RectAt({client.right - kCloseSize.width - 3, (client.bottom - kCloseSize.height) / 2},
                     kCloseSize);
}

void CCommandBar::LoadToolBar(const ToolBarTemplate& toolBar) {
  const auto count = std::count_if(toolBar.buttons.begin(), toolBar.buttons.end(),
                                   [](const ToolButton& button) { return button.commandID != 0; });
  const Size image = toolBar.imageSize;
  const CBitmap& strip = TheApp().Resources().LoadBitmap(
      toolBar.bitmapID, {image.width * static_cast<int>(count), image.height});
  int x = m_rcTitle.right + kSeparatorWidth;
  for (const ToolButton& button : toolBar.buttons) {
    if (button.commandID == 0) {
      m_arrSeparators.push_back(x + kSeparatorWidth / 2);
      x += kSeparatorWidth;
    } else {
      const int number = static_cast<int>(m_arrButtons.size());
      m_arrButtons.push_back({button, CutOut(strip, RectAt({number * image.width, 0}, image)),
                              RectAt({x, kTop}, kButtonSize), false});
      x += kButtonSize.width;
    }
  }
}

void CCommandBar::RefreshStates() {
  if (const bool enabled = TopLevel().IsEnabled();
      std::exchange(m_bMenuEnabled, enabled) != enabled) {
    Invalidate();
  }
  for (Button& button : m_arrButtons) {
    const bool enabled = TheApp().MainFrame()->IsCommandEnabled(button.tool.commandID);
    if (std::exchange(button.enabled, enabled) != enabled) Invalidate();
  }
}

bool CCommandBar::OpenMenuByKey(const KeyStroke& stroke) {
  const bool byLetter =
      stroke.key == Key::kCharacter && stroke.alt && stroke.character == MnemonicOf(m_menu.title);
  if (stroke.key != Key::kF10 && !byLetter) return false;
  OpenMenu();
  m_pMenu->SelectFirst();
  return true;
}

void CCommandBar::OpenMenu() {
  m_pMenu = std::make_unique<CMenuWindow>(
      m_menu, ScreenOrigin() + Point{m_rcTitle.left, m_rcTitle.bottom + 1}, [this] {
        m_bMenuOpen = false;
        Invalidate();
      });
  m_bMenuOpen = true;
  m_pMenu->Open();
  Invalidate();
}

ToolTip CCommandBar::TipAt(Point p) const {
  if (m_rcClose.Contains(p)) return {"Close", m_rcClose};
  for (const Button& button : m_arrButtons) {
    if (button.place.Contains(p)) return {button.tool.tip, button.place};
  }
  return {};
}

void CCommandBar::OnPaint(CSurface& surface) {
  surface.FillRect({0, GetClientRect().bottom - 1, GetClientRect().right, GetClientRect().bottom},
                   kShadowEdge);
  DrawTitle(surface);
  DrawTools(surface);
  if (!m_rcClose.IsEmpty()) DrawClose(surface);
}

void CCommandBar::DrawTitle(CSurface& surface) const {
  if (m_bMenuOpen) surface.FillRect(m_rcTitle, kHighlight);
  const int y = m_rcTitle.top + (m_rcTitle.Height() - kSystemFont.height) / 2;
  const Color color = m_bMenuOpen ? kWhite : m_bMenuEnabled ? kBlack : kDisabledText;
  DrawMnemonicText(surface, {m_rcTitle.left + kTitlePadding, y}, m_menu.title, color);
}

void CCommandBar::DrawTools(CSurface& surface) const {
  for (const int x : m_arrSeparators) {
    surface.FillRect({x, kTop + 2, x + 1, kTop + kButtonSize.height - 2}, kShadowEdge);
  }
  for (const Button& button : m_arrButtons) {
    const bool pressed = PressedPlace() == button.place;
    DrawButtonFace(surface, button.place, pressed);
    const Size size = button.image.GetSize();
    const Point at{button.place.left + (button.place.Width() - size.width) / 2,
                   button.place.top + (button.place.Height() - size.height) / 2};
    const Point shift{pressed ? 1 : 0, pressed ? 1 : 0};
    surface.DrawIcon(at + shift, button.enabled ? button.image : Greyed(button.image));
  }
}

void CCommandBar::DrawClose(CSurface& surface) const {
  DrawButtonFace(surface, m_rcClose, PressedPlace() == m_rcClose);
  DrawCross(surface, m_rcClose);
}

/// The place that shows pressed; an empty one where nothing does.
Rect CCommandBar::PressedPlace() const {
  if (!m_bStylusInside) return {};
  if (m_ePressed == Part::kClose) return m_rcClose;
  return m_ePressed == Part::kButton ? m_arrButtons[m_nPressedButton].place : Rect{};
}

void CCommandBar::OnLButtonDown(Point p) {
  m_ePressed = Part::kNone;
  if (m_rcTitle.Contains(p) && m_bMenuEnabled) {
    OpenMenu();
    TheApp().Screen().Capture(*m_pMenu);
    return;
  }
  if (m_rcClose.Contains(p)) m_ePressed = Part::kClose;
  for (std::size_t i = 0; i < m_arrButtons.size(); ++i) {
    if (m_arrButtons[i].place.Contains(p) && m_arrButtons[i].enabled) {
      m_ePressed = Part::kButton;
      m_nPressedButton = i;
    }
  }
  m_bStylusInside = true;
  Invalidate();
}

void CCommandBar::OnMouseMove(Point p) {
  const Rect place = m_ePressed == Part::kClose    ? m_rcClose
                     : m_ePressed == Part::kButton ? m_arrButtons[m_nPressedButton].place
                                                   : Rect{};
  if (m_bStylusInside == place.Contains(p)) return;
  m_bStylusInside = place.Contains(p);
  Invalidate();
}

void CCommandBar::OnPressLost() {
  m_ePressed = Part::kNone;
  m_bStylusInside = false;
  Invalidate();
}

void CCommandBar::OnLButtonUp(Point p) {
  OnMouseMove(p);
  const Part released = m_bStylusInside ? m_ePressed : Part::kNone;
  OnPressLost();
  if (released == Part::kClose) TheApp().Queue().Post({MessageKind::kClose, {}, 0, 0});
  if (released == Part::kButton) {
    TheApp().Queue().PostCommand(m_arrButtons[m_nPressedButton].tool.commandID);
  }
}

}  // namespace platform
