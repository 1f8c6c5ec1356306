// What only the blackjack table shows.

#include "platform/window/application.h"
#include "render/number_text.h"
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

int CTableLayout::TitleHeight() const {
  const platform::Font previous = m_pDC->SetFont(kBoxTitleFont);
  const int height = m_pDC->TextExtent(kBoxTitle).height;
  m_pDC->SetFont(previous);
  return height;
}

Rect CTableLayout::BoxRect(int titleHeight) const {
  const Point center = Center();
  const int half = ((titleHeight + 15) * 3) / 2;
  return {m_rcTable.left + 12, center.y - half, center.x, center.y + half};
}

void CTableLayout::DrawPlayerBox(int stake, double wallet, bool handInProgress) const {
  const int h = TitleHeight();
  const Rect box = BoxRect(h);
  const platform::SavedState saved(*m_pDC);
  m_pDC->SetBrush(m_crBox);
  m_pDC->SetPen(platform::kBlack);
  m_pDC->SetBackColor(m_crBox);
  m_pDC->SetTextColor(platform::kBlack);
  m_pDC->Rectangle(box);
  m_pDC->Rectangle({box.left, box.top, box.right, box.top + h + 10});

  m_pDC->SetFont(kBoxTitleFont);
  const int width = m_pDC->TextExtent(kBoxTitle).width;
  m_pDC->TextOut({(box.left + box.right) / 2 - width / 2, box.top + 5}, kBoxTitle);

  m_pDC->SetFont(kBoxFont);
  const int walletTop = box.top + h + 15;
  const int stakeTop = walletTop + h + 5;
  const int iconTop = stakeTop + h + 5;
  DrawMoneyLine(walletTop, h, NumberText("Wallet: $%.2f", wallet));
  DrawMoneyLine(stakeTop, h, NumberText("Current Bet: $%d", stake));

  platform::CResources& resources = platform::TheApp().Resources();
  const platform::Size icon{16, 16};
  m_pDC->DrawIcon({box.right - 37, iconTop},
                  resources.LoadIcon(handInProgress ? IDI_BET_DOWN_OFF : IDI_BET_DOWN, icon));
  m_pDC->DrawIcon({box.right - 21, iconTop},
                  resources.LoadIcon(handInProgress ? IDI_BET_UP_OFF : IDI_BET_UP, icon));
}

void CTableLayout::DrawMoneyLine(int top, int titleHeight, const std::string& text) const {
  const Rect box = BoxRect(titleHeight);
  m_pDC->DrawText({box.left + 5, top, box.right - 10, top + titleHeight + 1}, text,
                  platform::TextAlign::kRight);
}

void CTableLayout::DrawStrategyButton() const {
  CopyPicture(Center() + Point{48, -27}, {24, 22}, IDB_STRATEGY);
}

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
  CopyPicture(CardCorner(position, 0) - Point{0, 9}, {8, 4}, IDB_ACTIVE_MARK,
              platform::RasterOp::kAnd);
}

void CTableLayout::DrawInsuranceButtons() const {
  const int y = CardCorner(POS_BOTTOM, 0).y - 27;
  CopyPicture({Center().x - 64, y}, {73, 17}, IDB_INSURANCE);
  CopyPicture({Center().x + 10, y}, {55, 17}, IDB_NO_INSURANCE);
}

void CTableLayout::DrawVerdictLamp(bool correct) const {
  const Point at{m_rcTable.left + 16, BoxRect(TitleHeight()).top + 5};
  CopyPicture(at, {13, 13}, correct ? IDB_LAMP_GREEN : IDB_LAMP_RED);
}

}  // namespace feltside
