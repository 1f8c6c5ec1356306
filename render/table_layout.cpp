#include "render/table_layout.h"

namespace feltside {
namespace {
constexpr int kMargin = 10;  ///< between the outer fans and the table's edges
}  // namespace

using platform::Point;
using platform::Rect;

void CTableLayout::Prepare(platform::CSurface& surface, const Rect& client) {
  m_pDC = &surface;
  m_rcTable = client;
  m_nFanStepX = m_nCardWidth / 3;
  m_nFanStepY = m_nCardHeight / 3;
}

Point CTableLayout::Center() const {
  return {(m_rcTable.left + m_rcTable.right) / 2, (m_rcTable.top + m_rcTable.bottom) / 2};
}

void CTableLayout::GetCardPos(int& x, int& y, int position, int slot) const {
  const Point center = Center();
  const int bottom = m_rcTable.bottom - m_nCardHeight - kMargin;
  const int leftHalf = center.x - center.x / 2;
  const int rightHalf = center.x + center.x / 2;
  Point at{x, y};
  switch (position) {
    case POS_MIDDLE_ROW:
      at = {center.x - RowWidth() / 2 + slot * (m_nCardWidth + RowGap()),
            center.y - m_nCardHeight / 2};
      break;
    case POS_BOTTOM:
      at = {center.x + AlongFan(slot), bottom};
      break;
    case POS_TOP:
      at = {center.x + AlongFan(slot), kMargin};
      break;
    case POS_LEFT:
      at = {kMargin, center.y + AlongSideFan(slot)};
      break;
    case POS_RIGHT:
      at = {m_rcTable.right - m_nCardWidth - kMargin, center.y + AlongSideFan(slot)};
      break;
    case POS_BOTTOM_LEFT:
      at = {leftHalf + AlongFan(slot), bottom};
      break;
    case POS_BOTTOM_RIGHT:
      at = {rightHalf + AlongFan(slot), bottom};
      break;
    case POS_TOP_LEFT:
      at = {leftHalf + AlongFan(slot), kMargin};
      break;
    case POS_TOP_RIGHT:
      at = {rightHalf + AlongFan(slot), kMargin};
      break;
    default:
      break;
  }
  x = at.x;
  y = at.y;
}

int CTableLayout::RowGap() const { return m_nCardWidth / 6; }

int CTableLayout::RowWidth() const {
  return m_nRowCards * m_nCardWidth + (m_nRowCards - 1) * RowGap();
}

// Slot 1 stands on a fan's centred start, so that a hand of two reads as one in the middle.

int CTableLayout::AlongFan(int slot) const {
  return (slot - 1) * m_nFanStepX - ((m_nFanCards - 1) * m_nFanStepX + m_nCardWidth) / 2;
}

int CTableLayout::AlongSideFan(int slot) const {
  return (slot - 1) * m_nFanStepY - ((m_nFanCards - 1) * m_nFanStepY + m_nCardHeight) / 2;
}

Rect CTableLayout::GetPosRect(int position) const {
  if (position < POS_MIDDLE_ROW || position > POS_TOP_RIGHT) return {};
  platform::Size size{(m_nFanCards - 1) * m_nFanStepX + m_nCardWidth, m_nCardHeight};
  if (position == POS_MIDDLE_ROW) {
    size.width = RowWidth();
  } else if (position == POS_LEFT || position == POS_RIGHT) {
    size = {m_nCardWidth, (m_nFanCards - 1) * m_nFanStepY + m_nCardHeight};
  }
  return RectAt(CardCorner(position, 0), size);
}

Rect CTableLayout::CardRect(int position, int slot) const {
  return RectAt(CardCorner(position, slot), {m_nCardWidth, m_nCardHeight});
}

Point CTableLayout::CardCorner(int position, int slot) const {
  Point corner;
  GetCardPos(corner.x, corner.y, position, slot);
  return corner;
}

}  // namespace feltside
