#pragma once

#include "platform/dialog/press_control.h"

namespace platform {

/// A box that ticks and clears itself: by a press that ends on it, by Space, or by its mnemonic.
/// Its text is wrapped to its width.
class CCheckBox : public CPressControl {
 public:
  using CPressControl::CPressControl;

  const char* KindName() const override { return "check"; }
  int GetValue() const override { return m_bChecked ? 1 : 0; }
  std::string Words(const std::string&) const override;
  /// The dialog is not told; it reads the box when it is confirmed.
  void SetCheck(bool checked);
  /// Ticks a clear box and clears a ticked one.
  void Activate() override;

  void OnPaint(CSurface& surface) override;
  bool OnKeyDown(const KeyStroke& stroke) override;

 private:
  void DrawBox(CSurface& surface, const Rect& box) const;

  bool m_bChecked = false;
};

}  // namespace platform
