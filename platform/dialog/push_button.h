#pragma once

#include "platform/dialog/press_control.h"

namespace platform {

/// A button that does something when it is pushed: by a press that ends on it, by Space or Enter
/// while it has the focus, or by its mnemonic.
class CPushButton : public CPressControl {
 public:
  CPushButton(CDialog& dialog, const ControlTemplate& control, const Rect& place);

  const char* KindName() const override { return "button"; }
  std::string Words(const std::string&) const override;
  void Activate() override;
  /// Whether Enter means this button while no other has the focus.
  bool IsDefault() const { return m_bDefault; }

  void OnPaint(CSurface& surface) override;
  bool OnKeyDown(const KeyStroke& stroke) override;

 private:
  bool m_bDefault;
};

}  // namespace platform
