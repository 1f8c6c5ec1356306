#pragma once

#include "platform/dialog/control.h"

namespace platform {

/// Text that does nothing, wrapped to its width. Its mnemonic leads to the next control.
class CStatic : public CControl {
 public:
  CStatic(CDialog& dialog, const ControlTemplate& control, const Rect& place);

  const char* KindName() const override { return "static"; }
  /// A plain text is a value.
  bool IsLabelled() const override { return m_bPlainText; }
  std::string Words(const std::string& label) const override;
  void SetText(const std::string& text) override;
  char Mnemonic() const override { return m_bPlainText ? '\0' : CControl::Mnemonic(); }
  /// A label may stand close to its control, so only its letters are drawn.
  bool OnEraseBkgnd(CSurface&) override { return true; }
  void OnPaint(CSurface& surface) override;
  void Activate() override;

 private:
  bool m_bPlainText;
  bool m_bCentered;
};

/// A bordered static. The dialog may give it a colour: then it is a patch of nothing else.
class CPatch : public CControl {
 public:
  using CControl::CControl;

  const char* KindName() const override { return "patch"; }
  void OnPaint(CSurface& surface) override;
};

/// A bitmap resource at its own size, in the middle of its place.
class CPicture : public CControl {
 public:
  CPicture(CDialog& dialog, const ControlTemplate& control, const Rect& place);

  const char* KindName() const override { return "picture"; }
  void OnPaint(CSurface& surface) override;

 private:
  int m_nResourceID;
};

/// A frame around other controls, with or without a heading.
class CGroupBox : public CControl {
 public:
  using CControl::CControl;

  const char* KindName() const override { return "group"; }
  void OnPaint(CSurface& surface) override;
};

}  // namespace platform
