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
  const int gap = m_nCardWidth / 6;
  const int rowWidth = m_nRowCards * m_nCardWidth + (m_nRowCards - 1) * gap;
  const int fanLeft = ((m_nFanCards - 1) * m_nFanStepX + m_nCardWidth) / 2;
  const int fanUp = ((m_nFanCards - 1) * m_nFanStepY + m_nCardHeight) / 2;
  // Slot 1 stands on a fan's centred start, so that a hand of two reads as one in the middle.
  const int alongX = (slot - 1) * m_nFanStepX - fanLeft;
  const int alongY = (slot - 1) * m_nFanStepY - fanUp;
  const int bottom = m_rcTable.bottom - m_nCardHeight - kMargin;
  const int leftHalf = center.x - center.x / 2;
  const int rightHalf = center.x + center.x / 2;
  const auto put = [&x, &y](int toX, int toY) {
    x = toX;
    y = toY;
  };
  switch (position) {
    case POS_MIDDLE_ROW:
      return put(center.x - rowWidth / 2 + slot * (m_nCardWidth + gap),
                 center.y - m_nCardHeight / 2);
    case POS_BOTTOM:
      return put(center.x + alongX, bottom);
    case POS_TOP:
      return put(center.x + alongX, kMargin);
    case POS_LEFT:
      return put(kMargin, center.y + alongY);
    case POS_RIGHT:
      return put(m_rcTable.right - m_nCardWidth - kMargin, center.y + alongY);
    case POS_BOTTOM_LEFT:
      return put(leftHalf + alongX, bottom);
    case POS_BOTTOM_RIGHT:
      return put(rightHalf + alongX, bottom);
    case POS_TOP_LEFT:
      return put(leftHalf + alongX, kMargin);
    case POS_TOP_RIGHT:
      return put(rightHalf + alongX, kMargin);
    default:
      return;
  }
}

Rect CTableLayout::GetPosRect(int position) const {
  if (position < POS_MIDDLE_ROW || position > POS_TOP_RIGHT) return {};
  platform::Size size{(m_nFanCards - 1) * m_nFanStepX + m_nCardWidth, m_nCardHeight};
  if (position == POS_MIDDLE_ROW) {
    size.width = m_nRowCards * m_nCardWidth + (m_nRowCards - 1) * (m_nCardWidth / 6);
  } else if (position == POS_LEFT || position == POS_RIGHT) {
    size = {m_nCardWidth, (m_nFanCards - 1) * m_nFanStepY + m_nCardHeight};
  }
  return RectAt(CardCorner(position, 0), size);
}

Point CTableLayout::CardCorner(int position, int slot) const {
  Point corner;
  GetCardPos(corner.x, corner.y, position, slot);
  return corner;
}

}  // namespace feltside
