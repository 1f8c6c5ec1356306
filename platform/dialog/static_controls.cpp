#include "platform/dialog/static_controls.h"

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"
#include "platform/draw/wrapped_text.h"
#include "platform/window/application.h"

namespace platform {

CStatic::CStatic(CDialog& dialog, const ControlTemplate& control, const Rect& place)
    : CControl(dialog, control, place),
      m_bPlainText(control.plainText),
      m_bCentered(control.centered) {}

void CStatic::SetText(const std::string& text) {
  CControl::SetText(text);
  Dialog().Invalidate();
}

std::string CStatic::Words(const std::string& label) const {
  if (!m_bPlainText) return WithoutMnemonic(GetText());
  return GetText().empty() ? "" : label + " " + GetText();
}

void CStatic::OnPaint(CSurface& surface) {
  const int width = GetClientRect().right;
  if (m_bPlainText) {
    surface.SetFont(kSystemFont);
    surface.SetBackMode(BackMode::kTransparent);
    surface.TextOut({}, Ellipsized(GetText(), width));
    return;
  }
  int y = 0;
  for (const std::string& line : WrapText(GetText(), width)) {
    const int spare = width - MeasureText(kSystemFont, WithoutMnemonic(line)).width;
    DrawMnemonicText(surface, {m_bCentered ? spare / 2 : 0, y}, line, kBlack);
    y += kSystemFont.height;
  }
}

void CStatic::Activate() { Dialog().FocusAfter(*this); }

void CPatch::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  const auto color = Dialog().OnCtlColor(GetID());
  surface.SetPen(kBlack);
  surface.SetBrush(color.value_or(kFaceColor));
  surface.Rectangle(client);
  if (!color) DrawMnemonicText(surface, {2, 1}, GetText(), kBlack);
}

CPicture::CPicture(CDialog& dialog, const ControlTemplate& control, const Rect& place)
    : CControl(dialog, control, place), m_nResourceID(control.resourceID) {}

void CPicture::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  const Size size{client.right, client.bottom};
  const CBitmap& picture = TheApp().Resources().LoadBitmap(m_nResourceID, size);
  surface.BitBlt(
      {(size.width - picture.GetSize().width) / 2, (size.height - picture.GetSize().height) / 2},
      picture.GetSize(), picture);
}

void CGroupBox::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  const int top = GetText().empty() ? 0 : kSystemFont.height / 2;
  const Rect frame{0, top, client.right, client.bottom};
  surface.SetBrush(kFaceColor);
  surface.SetPen(kShadowEdge);
  surface.Rectangle(frame);
  if (GetText().empty()) return;
  const int width = MeasureText(kSystemFont, WithoutMnemonic(GetText())).width;
  surface.FillRect({8, 0, 8 + width + 4, kSystemFont.height}, kFaceColor);
  DrawMnemonicText(surface, {10, 0}, GetText(), kBlack);
}

}  // namespace platform
