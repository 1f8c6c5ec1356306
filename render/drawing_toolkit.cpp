// What every drawing of the table is put together from: cards, labels, hand texts and pictures.

#include "render/table_layout.h"

namespace feltside {
namespace {

constexpr platform::Font kHandFont{11, false};
constexpr platform::Font kHandFontBold{11, true};
constexpr platform::Font kMessageFont{14, true};
constexpr int kTextGap = 10;  ///< between a fan and the text beside it

}  // namespace

using platform::Point;
using platform::Rect;
using platform::Size;

void CTableLayout::DrawCard(int position, int slot, int bitmapID) const {
  if (position == -1 || slot == -1 || bitmapID < 1 || bitmapID > kLastCardBackID) return;
  const Size card{m_nCardWidth, m_nCardHeight};
  const platform::CBitmap& picture = m_pPictures->LoadBitmap(bitmapID, card);
  m_pDC->StretchBlt(CardRect(position, slot), picture, RectAt({}, card));
}

void CTableLayout::DrawHand(int position, CCardHand hand) const {
  for (int slot = 0; slot < hand.GetCount(); ++slot) {
    DrawCard(position, slot, hand.GetCard(slot));
  }
}

void CTableLayout::TextOnTable(Point at, const std::string& text) const {
  m_pDC->SetBackColor(m_crTable);
  m_pDC->SetBackMode(platform::BackMode::kTransparent);
  m_pDC->TextOut(at, text);
  m_pDC->SetBackMode(platform::BackMode::kOpaque);
}

void CTableLayout::DrawLabel(int position, const std::string& text) const {
  const platform::Font previous = m_pDC->SetFont(kHandFont);
  const Size extent = m_pDC->TextExtent(text);
  Point at = CardCorner(position, 0);
  at.x -= extent.width + kTextGap;
  const bool atTop = position == POS_TOP || position == POS_TOP_LEFT || position == POS_TOP_RIGHT;
  if (!atTop) at.y += m_nCardHeight - extent.height;
  TextOnTable(at, text);
  m_pDC->SetFont(previous);
}

Point CTableLayout::HandTextPos(int position, int textHeight) const {
  switch (position) {
    case POS_ABOVE_BOTTOM:
      return CardCorner(POS_BOTTOM, 0) - Point{0, textHeight + 8};
    case POS_ABOVE_BOTTOM_LEFT:
      return CardCorner(POS_BOTTOM_LEFT, 0) - Point{0, textHeight + 5};
    case POS_ABOVE_BOTTOM_RIGHT:
      return CardCorner(POS_BOTTOM_RIGHT, 0) - Point{0, textHeight + 5};
    case POS_TOP:
    case POS_TOP_LEFT:
    case POS_TOP_RIGHT:
      return CardCorner(position, m_nFanCards - 1) + Point{m_nCardWidth + kTextGap, 0};
    default:
      return CardCorner(position, m_nFanCards - 1) +
             Point{m_nCardWidth + kTextGap, m_nCardHeight - textHeight};
  }
}

void CTableLayout::DrawHandText(int position, const std::string& text, bool bold) const {
  const platform::Font previous = m_pDC->SetFont(bold ? kHandFontBold : kHandFont);
  const platform::Color previousColor = m_pDC->SetTextColor(kMessageColor);
  const Point at = HandTextPos(position, m_pDC->TextExtent(text).height);
  // The message of the whole deal is larger than the others, but stands as if it were not.
  if (position == POS_ABOVE_BOTTOM) m_pDC->SetFont(kMessageFont);
  TextOnTable(at, text);
  m_pDC->SetFont(previous);
  m_pDC->SetTextColor(previousColor);
}

void CTableLayout::DrawPicture(const Rect& place, int bitmapID, platform::RasterOp op) const {
  const Size size{place.Width(), place.Height()};
  m_pDC->BitBlt(place.TopLeft(), size, m_pPictures->LoadBitmap(bitmapID, size), {}, op);
}

void CTableLayout::DrawIcon(const Rect& place, int iconID) const {
  m_pDC->DrawIcon(place.TopLeft(), m_pPictures->LoadIcon(iconID, {place.Width(), place.Height()}));
}

}  // namespace feltside
