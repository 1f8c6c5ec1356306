// Video poker: the deal, the marks and the draw.

#include <algorithm>

#include "engine/poker.h"
#include "platform/dialog/message_box.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr double kStake = 1.0;
/// A deal takes at most ten cards, so the next one shuffles the deck again; but what blackjack has
/// left of it after taking eleven or more is dealt to its end.
constexpr int kReshuffleBelow = 11;

}  // namespace

void CFeltsideView::DealVideoPoker() {
  m_strPlayerMsg.clear();
  m_bHandInProgress = 1;
  m_bDrawPending = 1;
  m_dWallet -= kStake;
  if (m_deck1.GetPosition() < kReshuffleBelow) m_deck1.Shuffle();
  m_handPoker.Clear();
  for (int i = 0; i < kPokerCards; ++i) {
    const int card = DrawFrom(m_deck1, {&m_handPoker});
    // Never so with a whole deck; a faulty one is to be seen.
    if (!IsCard(card)) platform::MessageBox(std::to_string(card) + " is being put in!");
    m_handPoker.AddCard(card);
  }
  m_handPoker.Sort(1, 0);
  Repaint();
}

void CFeltsideView::ToggleDiscard(int slot) {
  int& mark = m_bDiscard[static_cast<std::size_t>(slot)];
  if (mark != 0) {
    mark = 0;
  } else if (std::count(m_bDiscard.begin(), m_bDiscard.end(), 1) < m_nMaxDiscards) {
    mark = 1;
  }
  Repaint();
}

void CFeltsideView::DrawVideoPoker() {
  // Cards that were thrown away do not come back in the same deal.
  CCardHand out = m_handPoker;
  out.SetLimit(2 * kPokerCards);
  int discarded = 0;
  // From the last slot to the first, so that the slots still to come stay where they are.
  for (int slot = m_handPoker.GetCount() - 1; slot >= 0; --slot) {
    if (m_bDiscard[static_cast<std::size_t>(slot)] == 0) continue;
    discarded += m_handPoker.RemoveCard(m_handPoker.GetCard(slot));
  }
  for (int i = 0; i < discarded; ++i) {
    const int card = DrawFrom(m_deck1, {&out});
    out.AddCard(card);
    m_handPoker.AddCard(card);
  }
  m_bDiscard.fill(0);
  m_dWallet += ScorePoker(m_handPoker, m_strPlayerMsg);
  m_bHandInProgress = 0;
  m_bDrawPending = 0;
  Repaint();
}

}  // namespace feltside
