// What only the plain video-poker table shows.

#include <array>

#include "engine/poker.h"
#include "render/money_text.h"
#include "render/table_layout.h"

namespace feltside {
namespace {

constexpr platform::Font kPayFont{11, false};
constexpr platform::Font kButtonFont{22, false};
constexpr platform::Color kButtonColor = platform::Rgb(0, 100, 255);
constexpr platform::Color kAmountColor = platform::Rgb(91, 152, 139);
/// The widest number of the pay table gives its columns their width and its rows their height.
constexpr char kWidestNumber[] = "888";

/// The categories of a row of the pay table, left and right.
struct PayRow {
  PokerCategory left;
  PokerCategory right;
};
constexpr std::array<PayRow, 4> kPayRows = {{{POKER_ROYAL_FLUSH, POKER_FLUSH},
                                             {POKER_STRAIGHT_FLUSH, POKER_STRAIGHT},
                                             {POKER_FOUR_OF_A_KIND, POKER_THREE_OF_A_KIND},
                                             {POKER_FULL_HOUSE, POKER_TWO_PAIR}}};

}  // namespace

using platform::Point;

void CTableLayout::DrawPayTable() const {
  const platform::SavedState saved(*m_pDC);
  const int bottom = CardCorner(POS_MIDDLE_ROW, 0).y - 5;
  m_pDC->SetFont(kPayFont);
  const platform::Size number = m_pDC->TextExtent(kWidestNumber);
  m_pDC->SetBrush(platform::kWhite);
  m_pDC->SetBackColor(platform::kWhite);
  m_pDC->Rectangle({m_rcTable.left + 2, m_rcTable.top + 2, m_rcTable.right - 2, bottom});
  m_pDC->Line({Center().x, 0}, {Center().x, bottom});
  for (int row = 0; row < static_cast<int>(kPayRows.size()); ++row) {
    DrawPayRow(row, number.height + 1, number.width);
  }
}

void CTableLayout::DrawPayRow(int row, int rowHeight, int numberWidth) const {
  const PayRow& categories = kPayRows[static_cast<std::size_t>(row)];
  const PokerReturn& left = kPokerReturns[static_cast<std::size_t>(categories.left)];
  const PokerReturn& right = kPokerReturns[static_cast<std::size_t>(categories.right)];
  const int y = m_rcTable.top + 2 + 3 + row * rowHeight;
  m_pDC->TextOut({m_rcTable.left + 2 + 3, y}, left.name);
  m_pDC->TextOut({Center().x - numberWidth - 3, y}, std::to_string(left.dollars));
  m_pDC->TextOut({Center().x + 3, y}, right.name);
  m_pDC->TextOut({m_rcTable.right - 3 - numberWidth, y}, std::to_string(right.dollars));
}

void CTableLayout::DrawPlayButton(bool deal) const {
  const platform::SavedState saved(*m_pDC);
  const std::string text = deal ? "Deal" : "Play";
  const platform::Rect button = DealButtonRect();
  m_pDC->SetFont(kButtonFont);
  const platform::Size extent = m_pDC->TextExtent(text);
  m_pDC->SetBrush(kButtonColor);
  m_pDC->SetBackColor(kButtonColor);
  m_pDC->Rectangle(button);
  m_pDC->TextOut({(button.left + button.right) / 2 - extent.width / 2,
                  (button.top + button.bottom) / 2 - extent.height / 2},
                 text);
}

void CTableLayout::DrawAmount(int position, int dollars) const {
  const platform::Font previous = m_pDC->SetFont(kPayFont);
  const platform::Color previousColor = m_pDC->SetTextColor(kAmountColor);
  const std::string text = MoneyText(dollars, 0);
  const platform::Size extent = m_pDC->TextExtent(text);
  const Point at = CardCorner(position, 0);
  TextOnTable({at.x - extent.width - 10, at.y - 2 * extent.height - 3 + m_nCardHeight}, text);
  m_pDC->SetFont(previous);
  m_pDC->SetTextColor(previousColor);
}

}  // namespace feltside
