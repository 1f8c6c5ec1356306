#include "platform/dialog/check_box.h"

#include <algorithm>

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"

namespace platform {
namespace {

constexpr int kBoxSize = 13;
constexpr int kTextLeft = kBoxSize + 3;

}  // namespace

void CCheckBox::SetCheck(bool checked) {
  m_bChecked = checked;
  Invalidate();
}

void CCheckBox::Activate() { SetCheck(!m_bChecked); }

std::string CCheckBox::Words(const std::string&) const {
  return WithoutMnemonic(GetText()) + ", check box, " + (m_bChecked ? "on" : "off");
}

void CCheckBox::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  const auto lines = WrapText(GetText(), client.right - kTextLeft - 1);
  const int height = static_cast<int>(lines.size()) * kSystemFont.height;
  const int top = std::max(0, (client.bottom - height) / 2);
  DrawBox(surface, RectAt({0, (client.bottom - kBoxSize) / 2}, {kBoxSize, kBoxSize}));
  int widest = 0;
  int y = top;
  for (const std::string& line : lines) {
    DrawMnemonicText(surface, {kTextLeft, y}, line, IsEnabled() ? kBlack : kDisabledText);
    widest = std::max(widest, MeasureText(kSystemFont, WithoutMnemonic(line)).width);
    y += kSystemFont.height;
  }
  if (HasFocus()) {
    const int right = std::min(client.right, kTextLeft + widest + 2);
    DrawFocusRect(surface, {kTextLeft - 2, top, right, top + height});
  }
}

void CCheckBox::DrawBox(CSurface& surface, const Rect& box) const {
  surface.SetPen(kBlack);
  surface.SetBrush(IsPressed() ? kPressedColor : kWhite);
  surface.Rectangle(box);
  if (!m_bChecked) return;
  // The tick: three pixels down to the right, then six up.
  for (int i = 0; i < 9; ++i) {
    const int y = i < 3 ? 5 + i : 9 - i;
    surface.FillRect(RectAt(box.TopLeft() + Point{2 + i, y}, {1, 3}),
                     IsEnabled() ? kBlack : kDisabledText);
  }
}

bool CCheckBox::OnKeyDown(const KeyStroke& stroke) {
  if (stroke.character != ' ') return false;
  Activate();
  return true;
}

}  // namespace platform
