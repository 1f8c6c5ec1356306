// What a tap can hit: where it stands, and which of it lies under a point.

#include "render/picture_ids.h"
#include "render/table_layout.h"

namespace feltside {

using platform::Point;
using platform::Rect;

Rect CTableLayout::StrategyButtonRect() const {
  return RectAt(Center() + Point{48, -27}, kStrategyPicture);
}

int CTableLayout::InsuranceTop() const { return CardCorner(POS_BOTTOM, 0).y - 27; }

Rect CTableLayout::InsuranceYesRect() const {
  return RectAt({Center().x - 64, InsuranceTop()}, kInsurancePicture);
}

Rect CTableLayout::InsuranceNoRect() const {
  return RectAt({Center().x + 10, InsuranceTop()}, kInsurancePicture);
}

Rect CTableLayout::InsuranceNoPicture() const {
  return RectAt(InsuranceNoRect().TopLeft(), kNoInsurancePicture);
}

int CTableLayout::BetTop() const { return BoxLineTop(2); }

Rect CTableLayout::BetDownRect() const {
  return {Center().x - 35, BetTop(), Center().x - 18, BetTop() + 20};
}

Rect CTableLayout::BetDownPicture() const {
  return RectAt({BoxRect().right - 37, BetTop()}, kBetIcon);
}

Rect CTableLayout::BetUpRect() const {
  return {Center().x - 21, BetTop(), Center().x - 1, BetTop() + 20};
}

Rect CTableLayout::BetUpPicture() const {
  return RectAt({BoxRect().right - 21, BetTop()}, kBetIcon);
}

Rect CTableLayout::DealButtonRect() const {
  const int top = CardCorner(POS_MIDDLE_ROW, 0).y + m_nCardHeight + 10;
  return {Center().x - 30, top, Center().x + 30, top + 40};
}

int CTableLayout::Hit(const Rect& target, Point p) const {
  return IsPrepared() && target.Contains(p) ? 1 : 0;
}

int CTableLayout::HitTestCard(Point p) const {
  if (!IsPrepared() || !GetPosRect(POS_MIDDLE_ROW).Contains(p)) return -1;
  for (int slot = 0; slot < m_nRowCards; ++slot) {
    const Rect card = CardRect(POS_MIDDLE_ROW, slot);
    if (card.left < p.x && p.x < card.right) return slot;
  }
  return -1;
}

}  // namespace feltside
