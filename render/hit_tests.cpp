// Which target of the table lies under a tap.

#include "render/table_layout.h"

namespace feltside {

using platform::Point;
using platform::Rect;

int CTableLayout::HitStrategyButton(Point p) const {
  const Point center = Center();
  return RectAt(center + Point{48, -27}, {24, 22}).Contains(p) ? 1 : 0;
}

int CTableLayout::HitInsuranceYes(Point p) const {
  const int y = CardCorner(POS_BOTTOM, 0).y;
  return Rect{Center().x - 64, y - 27, Center().x + 9, y - 10}.Contains(p) ? 1 : 0;
}

int CTableLayout::HitInsuranceNo(Point p) const {
  const int y = CardCorner(POS_BOTTOM, 0).y;
  return Rect{Center().x + 10, y - 27, Center().x + 83, y - 10}.Contains(p) ? 1 : 0;
}

int CTableLayout::StakeTop() const {
  const int h = TitleHeight();
  return BoxRect(h).top + 3 * h + 25;
}

int CTableLayout::HitBetDown(Point p) const {
  const int top = StakeTop();
  return Rect{Center().x - 35, top, Center().x - 18, top + 20}.Contains(p) ? 1 : 0;
}

int CTableLayout::HitBetUp(Point p) const {
  const int top = StakeTop();
  return Rect{Center().x - 21, top, Center().x - 1, top + 20}.Contains(p) ? 1 : 0;
}

int CTableLayout::HitDealButton(Point p) const { return PlayButtonRect().Contains(p) ? 1 : 0; }

int CTableLayout::HitTestCard(Point p) const {
  if (!GetPosRect(POS_MIDDLE_ROW).Contains(p)) return -1;
  for (int slot = 0; slot < m_nRowCards; ++slot) {
    const int left = CardCorner(POS_MIDDLE_ROW, slot).x;
    if (left < p.x && p.x < left + m_nCardWidth) return slot;
  }
  return -1;
}

}  // namespace feltside
