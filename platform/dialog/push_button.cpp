#include "platform/dialog/push_button.h"

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"

namespace platform {

CPushButton::CPushButton(CDialog& dialog, const ControlTemplate& control, const Rect& place)
    : CPressControl(dialog, control, place),
      m_bDefault(control.kind == ControlKind::kDefaultButton) {}

std::string CPushButton::Words(const std::string&) const {
  return WithoutMnemonic(GetText()) + ", button";
}

void CPushButton::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  surface.FillRect(client, m_bDefault ? kBlack : kFaceColor);
  DrawButtonFace(surface, client.Shrunk(1), IsPressed());
  const Size extent = MeasureText(kSystemFont, WithoutMnemonic(GetText()));
  const int shift = IsPressed() ? 1 : 0;
  DrawMnemonicText(
      surface,
      {(client.right - extent.width) / 2 + shift, (client.bottom - extent.height) / 2 + shift},
      GetText(), IsEnabled() ? kBlack : kDisabledText);
  if (HasFocus()) DrawFocusRect(surface, client.Shrunk(3));
}

bool CPushButton::OnKeyDown(const KeyStroke& stroke) {
  if (stroke.key != Key::kEnter && stroke.character != ' ') return false;
  Activate();
  return true;
}

void CPushButton::Activate() { Dialog().Push(GetID()); }

}  // namespace platform
