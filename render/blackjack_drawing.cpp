// What only the blackjack table shows.

#include "render/money_text.h"
#include "render/table_layout.h"

namespace feltside {
namespace {

constexpr platform::Font kBoxFont{13, false};
constexpr platform::Font kBoxTitleFont{13, true};
constexpr char kBoxTitle[] = "Player";
constexpr char kAdviceHeading[] = "Basic Strategy says:";

}  // namespace

using platform::Point;
using platform::Rect;

int CTableLayout::TitleHeight() { return platform::MeasureText(kBoxTitleFont, kBoxTitle).height; }

Rect CTableLayout::BoxRect() const {
  const Point center = Center();
  const int half = ((TitleHeight() + 15) * 3) / 2;
  return {m_rcTable.left + 12, center.y - half, center.x, center.y + half};
}

int CTableLayout::BoxLineTop(int line) const {
  const int h = TitleHeight();
  return BoxRect().top + h + 15 + line * (h + 5);
}

void CTableLayout::DrawPlayerBox(int stake, double wallet, bool handInProgress) const {
  const Rect box = BoxRect();
  const platform::SavedState saved(*m_pDC);
  m_pDC->SetBrush(m_crBox);
  m_pDC->SetBackColor(m_crBox);
  m_pDC->SetTextColor(platform::kBlack);
  m_pDC->Rectangle(box);
  m_pDC->Rectangle({box.left, box.top, box.right, box.top + TitleHeight() + 10});

  m_pDC->SetFont(kBoxTitleFont);
  const int width = m_pDC->TextExtent(kBoxTitle).width;
  m_pDC->TextOut({(box.left + box.right) / 2 - width / 2, box.top + 5}, kBoxTitle);

  m_pDC->SetFont(kBoxFont);
  DrawMoneyLine(0, "Wallet: " + MoneyText(wallet, 2));
  DrawMoneyLine(1, "Current Bet: " + MoneyText(stake, 0));
  DrawIcon(BetDownPicture(), handInProgress ? IDI_BET_DOWN_OFF : IDI_BET_DOWN);
  DrawIcon(BetUpPicture(), handInProgress ? IDI_BET_UP_OFF : IDI_BET_UP);
}

void CTableLayout::DrawMoneyLine(int line, const std::string& text) const {
  const Rect box = BoxRect();
  const int top = BoxLineTop(line);
  m_pDC->DrawText({box.left + 5, top, box.right - 10, top + TitleHeight() + 1}, text,
                  platform::TextAlign::kRight);
}

void CTableLayout::DrawStrategyButton() const { DrawPicture(StrategyButtonRect(), IDB_STRATEGY); }

void CTableLayout::DrawAdvice(const std::string& text) const {
  const platform::SavedState saved(*m_pDC);
  m_pDC->SetFont(kBoxFont);
  m_pDC->SetBackMode(platform::BackMode::kTransparent);
  m_pDC->SetTextColor(kMessageColor);
  const Point at = Center() + Point{5, 5};
  m_pDC->TextOut(at, kAdviceHeading);
  m_pDC->TextOut(at + Point{0, m_pDC->TextExtent(kAdviceHeading).height + 5}, text);
}

void CTableLayout::DrawActiveMarker(int position) const {
  DrawPicture(RectAt(CardCorner(position, 0) - Point{0, 9}, kActiveMark), IDB_ACTIVE_MARK,
              platform::RasterOp::kAnd);
}

void CTableLayout::DrawInsuranceButtons() const {
  DrawPicture(InsuranceYesRect(), IDB_INSURANCE);
  DrawPicture(InsuranceNoPicture(), IDB_NO_INSURANCE);
}

void CTableLayout::DrawVerdictLamp(bool correct) const {
  const Point at{m_rcTable.left + 16, BoxRect().top + 5};
  DrawPicture(RectAt(at, kLamp), correct ? IDB_LAMP_GREEN : IDB_LAMP_RED);
}

}  // namespace feltside
