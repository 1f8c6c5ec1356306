// One video-poker frame, from the state of the table.

#include <cmath>

#include "render/money_text.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr platform::Font kFancyFont{15, true};
// The cells of the picture on which its texts stand.
constexpr platform::Color kButtonCell = platform::Rgb(82, 23, 139);
constexpr platform::Color kWalletCell = platform::Rgb(20, 71, 139);
constexpr platform::Color kResultCell = platform::Rgb(82, 115, 132);
constexpr platform::Color kResultColor = platform::Rgb(180, 0, 0);
constexpr platform::Point kButtonTextAt{103, 192};
constexpr platform::Point kWalletTextAt{26, 233};
constexpr platform::Point kResultTextAt{135, 235};

}  // namespace

void CFeltsideView::DrawVideoPokerTable(platform::CSurface& surface) {
  if (m_nGameType != kGameVideoPoker) return;
  if (m_bFancyPoker != 0) {
    LoadPokerBitmap();
    surface.BitBlt({}, kPokerPicture, *m_pPokerBitmap);
  }
  for (int slot = 0; slot < m_handPoker.GetCount(); ++slot) {
    if (m_bDiscard[static_cast<std::size_t>(slot)] != 0) {
      m_layout.DrawCardBack(POS_MIDDLE_ROW, slot);
    } else {
      m_layout.DrawCard(POS_MIDDLE_ROW, slot, m_handPoker.GetCard(slot));
    }
  }
  if (m_bFancyPoker != 0) {
    DrawFancyPokerTexts(surface);
  } else {
    m_layout.DrawHandText(POS_BOTTOM, m_strPlayerMsg, false);
    m_layout.DrawPayTable();
    m_layout.DrawPlayButton(m_bHandInProgress == 0);
    m_layout.DrawLabel(POS_BOTTOM, "You");
    m_layout.DrawAmount(POS_BOTTOM, WholeDollars(m_dWallet));
  }
}

void CFeltsideView::DrawFancyPokerTexts(platform::CSurface& surface) {
  const platform::SavedState saved(surface);
  surface.SetFont(kFancyFont);
  surface.SetTextColor(platform::kWhite);
  surface.SetBackColor(kButtonCell);
  surface.TextOut(kButtonTextAt, m_bHandInProgress == 0 ? "Deal" : "Play");
  surface.SetBackColor(kWalletCell);
  // Halves always go up, so that every deal shows a dollar less.
  surface.TextOut(kWalletTextAt, MoneyText(std::floor(m_dWallet + 0.5), 0));
  surface.SetBackColor(kResultCell);
  surface.SetTextColor(kResultColor);
  surface.TextOut(kResultTextAt, m_strPlayerMsg);
}

}  // namespace feltside
