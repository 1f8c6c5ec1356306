#pragma once

#include "platform/dialog/control.h"

namespace platform {

/// One line of UTF-8 text to type into: cursor keys, Home and End, selection with Shift or by
/// dragging, cut, copy and paste, also by the middle button, scrolling sideways. Line breaks and
/// other control characters of a paste become blanks. What an input method composes is shown
/// underlined where it will stand.
class CEditBox : public CControl {
 public:
  CEditBox(CDialog& dialog, const ControlTemplate& control, const Rect& place)
      : CControl(dialog, control, place) {}

  const char* KindName() const override { return "edit"; }
  bool IsTabStop() const override { return true; }
  bool WantsLetters() const override { return true; }
  bool IsLabelled() const override { return true; }
  std::string Words(const std::string& label) const override;
  void SetText(const std::string& text) override;
  char Mnemonic() const override { return 0; }
  void Activate() override { TakeFocus(); }

  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override;
  void OnMouseMove(Point p) override { PointAt(p, true); }
  bool OnKeyDown(const KeyStroke& stroke) override;
  bool OnChar(const std::string& text) override;
  bool OnComposition(const std::string& text) override;
  void OnMiddleClick(Point p, const std::string& text) override;
  void OnFocus(bool focused) override;

 private:
  std::size_t SelectionStart() const;
  std::size_t SelectionEnd() const;
  std::string Selected() const;
  /// The text with the composition in it.
  std::string Shown() const;
  std::size_t CompositionEnd() const { return m_nCaret + m_strComposition.size(); }
  /// The column of a place in what is shown.
  int CaretX(std::size_t at) const;
  /// The place between letters nearest to a column of the client area.
  std::size_t PlaceAt(int x) const;
  void PointAt(Point p, bool select);
  void MoveCaret(std::size_t to, bool select);
  /// Puts a text in the selection's stead.
  void Insert(const std::string& text);
  bool OnMoveKey(const KeyStroke& stroke);
  bool OnClipboardKey(const KeyStroke& stroke);
  void Erase(bool forwards);
  void ScrollToCaret();
  /// Tells the host where text goes.
  void PlaceTextInput();
  void DrawShown(CSurface& inside);

  std::size_t m_nCaret = 0;      ///< byte places in the text, always between letters
  std::size_t m_nAnchor = 0;     ///< the selection's other end
  std::string m_strComposition;  ///< stands behind the caret; while there is one, nothing is marked
  int m_nScroll = 0;             ///< pixels of text to the left of the box
};

/// A line that only shows a number, at its right.
class CNumberBox : public CControl {
 public:
  using CControl::CControl;

  const char* KindName() const override { return "edit"; }
  void OnPaint(CSurface& surface) override;
};

}  // namespace platform
