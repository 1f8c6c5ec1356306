#pragma once

#include "platform/dialog/control.h"

namespace platform {

/// A control that is activated by a press that ends on it.
class CPressControl : public CControl {
 public:
  using CControl::CControl;

  bool IsTabStop() const override { return true; }
  void OnLButtonDown(Point p) override;
  void OnMouseMove(Point p) override;
  void OnLButtonUp(Point p) override;
  void OnPressLost() override;

 protected:
  bool IsPressed() const { return m_bPressed; }

 private:
  bool m_bPressed = false;
};

}  // namespace platform
