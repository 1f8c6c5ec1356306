// How a frame is put together: the title until the first deal, then the table, in the window's own
// pixels, which nobody sees before they are whole.

#include "platform/window/application.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

/// Loads a picture into a pointer that has none yet.
void LoadOnce(std::unique_ptr<platform::CBitmap>& picture, int bitmapID, platform::Size size) {
  if (picture != nullptr) return;
  picture = std::make_unique<platform::CBitmap>(
      platform::TheApp().Resources().ReadBitmap(bitmapID, size));
}

}  // namespace

using platform::CSurface;
using platform::Rect;

bool CFeltsideView::OnEraseBkgnd(CSurface&) { return true; }

void CFeltsideView::OnDraw(CSurface& surface) {
  if (m_bShowTitle != 0) {
    DrawTitle(surface);
  } else {
    DrawTable(surface);
  }
}

void CFeltsideView::DrawTitle(CSurface& surface) {
  LoadTitleBitmap();
  const Rect client = GetClientRect();
  surface.FillRect(client, platform::kWhite);
  surface.BitBlt({client.Width() / 2 - kTitlePicture.width / 2,
                  client.Height() / 2 - kTitlePicture.height / 2},
                 kTitlePicture, *m_pTitleBitmap);
}

void CFeltsideView::DrawTable(CSurface& surface) {
  LoadTableBitmap();
  const Rect client = GetClientRect();
  CSurface frame(surface, client);
  frame.FillRect(frame.Bounds(), m_layout.m_crTable);
  if (m_bFancyBlackjack != 0) frame.BitBlt({}, kTablePicture, *m_pTableBitmap);
  m_layout.Prepare(frame, client);
  if (m_nGameType == kGameBlackjack) {
    DrawBlackjackTable();
  } else {
    DrawVideoPokerTable(frame);
  }
  m_layout.Release();
}

void CFeltsideView::LoadTitleBitmap() {
  if (m_bShowTitle != 0) LoadOnce(m_pTitleBitmap, IDB_TITLE, kTitlePicture);
}

void CFeltsideView::LoadTableBitmap() { LoadOnce(m_pTableBitmap, IDB_TABLE, kTablePicture); }

void CFeltsideView::LoadPokerBitmap() { LoadOnce(m_pPokerBitmap, IDB_POKER_TABLE, kPokerPicture); }

}  // namespace feltside
