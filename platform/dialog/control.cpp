#include "platform/dialog/control.h"

#include "platform/dialog/check_box.h"
#include "platform/dialog/combo_box.h"
#include "platform/dialog/dialog.h"
#include "platform/dialog/edit_box.h"
#include "platform/dialog/push_button.h"
#include "platform/dialog/slider.h"
#include "platform/dialog/static_controls.h"
#include "platform/dialog/up_down.h"
#include "platform/draw/look.h"

namespace platform {

CControl::CControl(CDialog& dialog, const ControlTemplate& control, const Rect& place)
    : CWindow(&dialog, place),
      m_dialog(dialog),
      m_nID(control.controlID),
      m_strText(control.text) {}

void CControl::SetText(const std::string& text) {
  m_strText = text;
  Invalidate();
}

char CControl::Mnemonic() const { return MnemonicOf(m_strText); }

bool CControl::HasFocus() { return m_dialog.IsEnabled() && m_dialog.GetFocus() == this; }

void CControl::TakeFocus() { m_dialog.SetFocus(this); }

std::unique_ptr<CControl> MakeControl(CDialog& dialog, const ControlTemplate& control,
                                      const Rect& place) {
  switch (control.kind) {
    case ControlKind::kStatic:
      return std::make_unique<CStatic>(dialog, control, place);
    case ControlKind::kPatch:
      return std::make_unique<CPatch>(dialog, control, place);
    case ControlKind::kPicture:
      return std::make_unique<CPicture>(dialog, control, place);
    case ControlKind::kGroupBox:
      return std::make_unique<CGroupBox>(dialog, control, place);
    case ControlKind::kPushButton:
    case ControlKind::kDefaultButton:
      return std::make_unique<CPushButton>(dialog, control, place);
    case ControlKind::kCheckBox:
      return std::make_unique<CCheckBox>(dialog, control, place);
    case ControlKind::kComboBox:
      return std::make_unique<CComboBox>(dialog, control, place);
    case ControlKind::kEdit:
      return std::make_unique<CEditBox>(dialog, control, place);
    case ControlKind::kNumberBox:
      return std::make_unique<CNumberBox>(dialog, control, place);
    case ControlKind::kUpDown:
      return std::make_unique<CUpDown>(dialog, control, place);
    case ControlKind::kSlider:
      return std::make_unique<CSlider>(dialog, control, place);
  }
  return nullptr;
}

}  // namespace platform
