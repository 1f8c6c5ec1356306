#pragma once

#include "platform/dialog/control.h"

namespace platform {

/// A vertical slider whose value grows downwards; the thumb points to the left. It is dragged,
/// pressed beside the thumb (a page), moved by the arrows (a line), Page Up and Page Down (a page),
/// Home and End, and tells the dialog of every movement.
class CSlider : public CControl {
 public:
  using CControl::CControl;

  const char* KindName() const override { return "slider"; }
  bool IsTabStop() const override { return true; }
  bool IsLabelled() const override { return true; }
  std::string Words(const std::string& label) const override;
  int GetValue() const override { return m_nPos; }
  int GetLowest() const { return m_nLowest; }
  int GetHighest() const { return m_nHighest; }
  /// The position stays; it is for SetPos to bring it into the range.
  void SetRange(int lowest, int highest);
  /// How far an arrow key or a notch, and a press beside the thumb, move it.
  void SetSteps(int line, int page);
  /// The nearest position within the range. The dialog is not told.
  void SetPos(int pos);
  /// Moves as the person does: within the range, and the dialog is told.
  void MoveTo(int pos);
  /// The middle of the thumb at a position, in client pixels.
  Point ThumbMiddle(int pos) const;

  void OnPaint(CSurface& surface) override;
  void OnLButtonDown(Point p) override;
  void OnMouseMove(Point p) override;
  void OnLButtonUp(Point) override { OnPressLost(); }
  void OnPressLost() override;
  void OnMouseWheel(int notches) override { MoveTo(m_nPos - notches * m_nLine); }
  bool OnKeyDown(const KeyStroke& stroke) override;

 private:
  Rect Thumb() const;
  int TravelLength() const;
  int PosAt(int y) const;

  int m_nLowest = 0;
  int m_nHighest = 100;
  int m_nPos = 0;
  int m_nLine = 1;
  int m_nPage = 10;
  bool m_bDragging = false;
  int m_nGrip = 0;  ///< from the thumb's middle down to where it was taken
};

}  // namespace platform
