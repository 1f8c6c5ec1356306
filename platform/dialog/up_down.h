#pragma once

#include "platform/dialog/control.h"

namespace platform {

/// Keeps a number within a range and writes it, in decimal, into its buddy: the control that stands
/// before it in the template.
class CUpDown : public CControl {
 public:
  using CControl::CControl;

  const char* KindName() const override { return "updown"; }
  int GetValue() const override { return m_nPos; }
  /// The control must outlive this one; null: none.
  void SetBuddy(CControl* buddy) { m_pBuddy = buddy; }
  void SetRange(int lowest, int highest);
  /// A position outside the range becomes the nearest bound.
  void SetPos(int pos);

 private:
  CControl* m_pBuddy = nullptr;
  int m_nLowest = 0;
  int m_nHighest = 100;
  int m_nPos = 0;
};

}  // namespace platform
