#include "platform/dialog/slider.h"

#include <algorithm>

#include "platform/dialog/dialog.h"
#include "platform/draw/look.h"

namespace platform {
namespace {

constexpr int kThumbHeight = 11;
constexpr int kThumbWidth = 20;
constexpr int kMargin = 3;  ///< above and below the channel

}  // namespace

std::string CSlider::Words(const std::string& label) const {
  return label + " slider at " + std::to_string(m_nPos);
}

void CSlider::SetRange(int lowest, int highest) {
  m_nLowest = lowest;
  m_nHighest = highest;
}

void CSlider::SetSteps(int line, int page) {
  m_nLine = line;
  m_nPage = page;
}

void CSlider::SetPos(int pos) {
  m_nPos = std::clamp(pos, m_nLowest, m_nHighest);
  Invalidate();
}

int CSlider::TravelLength() const { return GetClientRect().bottom - 2 * kMargin - kThumbHeight; }

Point CSlider::ThumbMiddle(int pos) const {
  const int travel = (pos - m_nLowest) * TravelLength() / std::max(1, m_nHighest - m_nLowest);
  return {GetClientRect().right / 2, kMargin + kThumbHeight / 2 + travel};
}

Rect CSlider::Thumb() const {
  const Point middle = ThumbMiddle(m_nPos);
  return RectAt({middle.x - kThumbWidth / 2, middle.y - kThumbHeight / 2},
                {kThumbWidth, kThumbHeight});
}

/// The position whose thumb's middle is nearest to a row.
int CSlider::PosAt(int y) const {
  const int range = m_nHighest - m_nLowest;
  const int travel = std::clamp(y - kMargin - kThumbHeight / 2, 0, TravelLength());
  return m_nLowest + (travel * range + TravelLength() / 2) / std::max(1, TravelLength());
}

void CSlider::OnPaint(CSurface& surface) {
  const Rect client = GetClientRect();
  const int middle = client.right / 2;
  surface.SetPen(kShadowEdge);
  surface.SetBrush(kWhite);
  surface.Rectangle({middle - 2, kMargin, middle + 2, client.bottom - kMargin});
  const Rect thumb = Thumb();
  const int tip = kThumbHeight / 2;
  const Color face = m_bDragging ? kPressedColor : kFaceColor;
  for (int row = 0; row < kThumbHeight; ++row) {
    const int indent = row <= tip ? tip - row : row - tip;
    const Rect line{thumb.left + indent, thumb.top + row, thumb.right, thumb.top + row + 1};
    const bool edge = row == 0 || row == kThumbHeight - 1;
    surface.FillRect(line, kBlack);
    if (!edge) surface.FillRect({line.left + 1, line.top, line.right - 1, line.bottom}, face);
  }
  if (HasFocus()) DrawFocusRect(surface, client);
}

void CSlider::MoveTo(int pos) {
  const int within = std::clamp(pos, m_nLowest, m_nHighest);
  if (within == m_nPos) return;
  SetPos(within);
  Dialog().OnVScroll(GetID());
}

void CSlider::OnLButtonDown(Point p) {
  TakeFocus();
  const Rect thumb = Thumb();
  if (p.y < thumb.top) {
    MoveTo(m_nPos - m_nPage);
  } else if (p.y >= thumb.bottom) {
    MoveTo(m_nPos + m_nPage);
  } else {
    m_bDragging = true;
    m_nGrip = p.y - ThumbMiddle(m_nPos).y;
    Invalidate();
  }
}

void CSlider::OnMouseMove(Point p) {
  const int row = p.y - m_nGrip;
  // Several positions share a row: within it the thumb has not moved.
  if (m_bDragging && row != ThumbMiddle(m_nPos).y) MoveTo(PosAt(row));
}

void CSlider::OnPressLost() {
  m_bDragging = false;
  Invalidate();
}

bool CSlider::OnKeyDown(const KeyStroke& stroke) {
  switch (stroke.key) {
    case Key::kUp:
    case Key::kLeft:
      MoveTo(m_nPos - m_nLine);
      return true;
    case Key::kDown:
    case Key::kRight:
      MoveTo(m_nPos + m_nLine);
      return true;
    case Key::kPageUp:
      MoveTo(m_nPos - m_nPage);
      return true;
    case Key::kPageDown:
      MoveTo(m_nPos + m_nPage);
      return true;
    case Key::kHome:
      MoveTo(m_nLowest);
      return true;
    case Key::kEnd:
      MoveTo(m_nHighest);
      return true;
    default:
      return false;
  }
}

}  // namespace platform
