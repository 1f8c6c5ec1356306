#include "platform/dialog/combo_box.h"

#include <algorithm>

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"
#include "platform/window/application.h"

namespace platform {
namespace {

constexpr int kLineHeight = 20;
constexpr int kArrowWidth = 16;

Rect LineOf(const Rect& place) {
  return {place.left, place.top, place.right, place.top + kLineHeight};
}

}  // namespace

CComboBox::CComboBox(CDialog& dialog, const ControlTemplate& control, const Rect& place)
    : CControl(dialog, control, LineOf(place)), m_arrItems(control.items) {}

std::string CComboBox::Words(const std::string& label) const {
  return label + " list, " + (m_nChoice < 0 ? "no choice" : GetText());
}

void CComboBox::SetCurSel(int item) {
  m_nChoice = item < 0 || item >= GetItemCount() ? -1 : item;
  SetText(m_nChoice < 0 ? "" : m_arrItems[static_cast<std::size_t>(m_nChoice)]);
}

void CComboBox::Choose(int item) {
  if (item == m_nChoice || item >= GetItemCount()) return;
  SetCurSel(item);
  Dialog().OnSelChange(GetID());
}

void CComboBox::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  surface.SetPen(kBlack);
  surface.SetBrush(IsEnabled() ? kWhite : kFaceColor);
  surface.Rectangle(client);
  const Rect arrow{client.right - kArrowWidth - 1, 1, client.right - 1, client.bottom - 1};
  DrawButtonFace(surface, arrow, false);
  for (int i = 0; i < 4; ++i) {
    const Point at{arrow.left + 4 + i, arrow.top + 7 + i};
    surface.FillRect(RectAt(at, {8 - 2 * i, 1}), kBlack);
  }
  const Rect text{2, 2, arrow.left - 1, client.bottom - 2};
  if (HasFocus()) surface.FillRect(text, kHighlight);
  surface.SetFont(kSystemFont);
  surface.SetBackMode(BackMode::kTransparent);
  surface.SetTextColor(HasFocus() ? kWhite : kBlack);
  surface.DrawText({text.left + 2, 4, text.right, text.bottom}, GetText(), TextAlign::kLeft);
}

void CComboBox::Drop() {
  m_pList = std::make_unique<CDropList>(m_arrItems, m_nChoice,
                                        RectAt(ScreenOrigin(), {GetPlace().Width(), kLineHeight}),
                                        [this](int item) { Choose(item); });
  m_pList->Open();
}

void CComboBox::Activate() {
  TakeFocus();
  Drop();
}

void CComboBox::OnLButtonDown(Point) {
  Activate();
  // The same press may go on into the list and end on an item.
  TheApp().Screen().Capture(*m_pList);
}

void CComboBox::OnMouseWheel(int notches) {
  TakeFocus();
  Step(-notches);
}

void CComboBox::Step(int items) {
  if (!m_arrItems.empty()) Choose(std::clamp(m_nChoice + items, 0, GetItemCount() - 1));
}

bool CComboBox::OnKeyDown(const KeyStroke& stroke) {
  if (stroke.key == Key::kF4 || stroke.character == ' ' ||
      (stroke.key == Key::kDown && stroke.alt)) {
    Drop();
    return true;
  }
  if (stroke.alt || stroke.ctrl) return false;
  switch (stroke.key) {
    case Key::kUp:
      Step(-1);
      return true;
    case Key::kDown:
      Step(1);
      return true;
    case Key::kHome:
      Choose(0);
      return true;
    case Key::kEnd:
      Choose(GetItemCount() - 1);
      return true;
    case Key::kCharacter:
      if (const int item = NextItemByLetter(m_arrItems, m_nChoice + 1, stroke.character);
          item >= 0) {
        Choose(item);
        return true;
      }
      return false;
    default:
      return false;
  }
}

}  // namespace platform
