// The dealer's play and the settlement that follows.

#include <vector>

#include "platform/window/application.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr int kDealerStands = 17;
constexpr int kDealerCards = 5;  ///< the dealer draws no sixth card

/// Whether what was already waiting when the dealer began waits on until the deal is settled, as it
/// would if it came in a pause: all but the commands of a player who is still at it.
bool WaitsForTheEnd(const platform::Message& message) {
  return message.kind != platform::MessageKind::kCommand ||
         message.commandID == platform::kCommandExit;
}

}  // namespace

void CFeltsideView::DealerPlay() {
  m_bHandInProgress = 0;
  m_strDealerScore = std::to_string(m_handDealer.GetTotal());
  // None of what arrives may touch the deal being settled: the disabled frame refuses commands, and
  // shows its menu and buttons grey.
  TopLevel().EnableWindow(false);
  platform::TheApp().MainFrame()->RefreshCommandStates();
  PumpMessages();
  while (m_handDealer.GetTotal() < kDealerStands && m_handDealer.GetCount() < kDealerCards) {
    m_handDealer.AddCard(NextCard());
    m_strDealerScore = std::to_string(m_handDealer.GetTotal());
    Repaint();
    if (m_handDealer.GetTotal() < kDealerStands) platform::Sleep(m_nDealerDelay);
  }
  // A key struck in impatience would deal anew before the result could be read.
  platform::TheApp().Queue().DropKeys();
  TopLevel().EnableWindow(true);
  Settle();
}

void CFeltsideView::PumpMessages() {
  platform::CApplication& app = platform::TheApp();
  std::vector<platform::Message> later;
  platform::Message message;
  while (app.Queue().Peek(message)) {
    if (WaitsForTheEnd(message)) {
      later.push_back(message);
    } else {
      app.Dispatch(message);
    }
  }
  for (const platform::Message& waiting : later) app.Queue().Post(waiting);
}

void CFeltsideView::Settle() {
  m_bHandInProgress = 0;
  const bool natural =
      m_handPlayer.GetTotal() == kTwentyOne && m_handPlayer.GetCount() == 2 && !IsSplit();
  if (natural) {
    m_dWallet += 1.5 * m_nBet;
  } else {
    m_strPlayerMsg = SettleHand(m_handPlayer, m_bDoubledPlayer != 0 ? 2 * m_nBet : m_nBet);
  }
  if (IsSplit()) {
    m_strSplitMsg = SettleHand(m_handSplit, m_bDoubledSplit != 0 ? 2 * m_nBet : m_nBet);
  }
  Repaint();
}

std::string CFeltsideView::SettleHand(const CBlackjackHand& hand, int stake) {
  const int total = hand.GetTotal();
  const int dealer = m_handDealer.GetTotal();
  if (total <= kTwentyOne && total == dealer) return "Push!";
  const bool won = total <= kTwentyOne && (dealer > kTwentyOne || dealer < total);
  m_dWallet += won ? stake : -stake;
  return won ? "Winner!" : "Dealer Wins!";
}

}  // namespace feltside
