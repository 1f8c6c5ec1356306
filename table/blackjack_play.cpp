// Blackjack as the player plays it: the deal, the insurance question, the moves and the stake.

#include "table/feltside_view.h"

namespace feltside {
namespace {

constexpr int kBlackjackHandLimit = 12;
constexpr int kBetStep = 5;
constexpr char kBlackjackText[] = "Blackjack!";

std::string TotalText(const CBlackjackHand& hand) { return std::to_string(hand.GetTotal()); }

}  // namespace

void CFeltsideView::DealBlackjack() {
  m_bShowVerdict = 0;
  m_bDoubledSplit = 0;
  m_bInsuranceTaken = 0;
  m_bPlayingSplit = 0;
  m_bShowAdvice = 0;
  m_bDoubledPlayer = 0;
  m_bInsuranceOffered = 0;
  m_bHandInProgress = 1;
  PrepareShoe();
  for (CBlackjackHand* hand : {&m_handPlayer, &m_handSplit, &m_handDealer}) {
    hand->Clear();
    hand->SetLimit(kBlackjackHandLimit);
  }
  for (CBlackjackHand* hand : {&m_handPlayer, &m_handPlayer, &m_handDealer, &m_handDealer}) {
    hand->AddCard(NextCard());
  }
  m_strPlayerScore = TotalText(m_handPlayer);
  m_strPlayerMsg.clear();
  m_strSplitMsg.clear();
  m_strSplitScore.clear();
  m_strDealerScore.clear();

  if (m_handPlayer.GetTotal() == kTwentyOne) {
    m_strPlayerScore = kBlackjackText;
    Settle();
  } else if (RankOf(UpCard()) == kAce) {
    m_bInsuranceOffered = 1;
    Repaint();
  } else if (m_handDealer.GetTotal() == kTwentyOne) {
    m_strDealerScore = kBlackjackText;
    Settle();
  } else {
    Repaint();
  }
}

void CFeltsideView::AnswerInsurance(int taken) {
  m_bInsuranceTaken = taken;
  m_bInsuranceOffered = 0;
  ResolveInsurance();
}

void CFeltsideView::ResolveInsurance() {
  if (m_handDealer.GetTotal() == kTwentyOne) {
    m_strPlayerMsg = "Dealer Wins!";
    m_strDealerScore = kBlackjackText;
    m_bHandInProgress = 0;
    m_dWallet -= m_bInsuranceTaken != 0 ? 0.5 * m_nBet : m_nBet;
  } else if (m_bInsuranceTaken != 0) {
    m_dWallet -= 0.5 * m_nBet;
  }
  Repaint();
}

void CFeltsideView::Hit() {
  CBlackjackHand& hand = ActiveHand();
  if (hand.GetTotal() > kTwentyOne) return;
  hand.AddCard(NextCard());
  const int total = hand.GetTotal();
  const bool playingSplit = m_bPlayingSplit != 0;
  ActiveScore() = TotalText(hand);
  if (total > kTwentyOne) ActiveMsg() = "Bust";
  if (total < kTwentyOne) {
    Repaint();
  } else if (!playingSplit && IsSplit()) {
    PlaySplitHand();
  } else if (!playingSplit && total > kTwentyOne) {
    Settle();
  } else {
    DealerPlay();
  }
}

void CFeltsideView::Stand() {
  if (m_bPlayingSplit == 0 && IsSplit()) {
    PlaySplitHand();
  } else {
    DealerPlay();
  }
}

void CFeltsideView::PlaySplitHand() {
  m_bPlayingSplit = 1;
  Repaint();
}

void CFeltsideView::DoubleDown() {
  CBlackjackHand& hand = ActiveHand();
  const bool playingSplit = m_bPlayingSplit != 0;
  (playingSplit ? m_bDoubledSplit : m_bDoubledPlayer) = 1;
  hand.AddCard(NextCard());
  const bool bust = hand.GetTotal() > kTwentyOne;
  ActiveScore() = TotalText(hand);
  ActiveMsg() = bust ? "Bust!" : TotalText(hand);
  if (!playingSplit && IsSplit()) {
    PlaySplitHand();
  } else if (!playingSplit && bust) {
    Settle();
  } else {
    if (!playingSplit) Repaint();
    DealerPlay();
  }
}

void CFeltsideView::Split() {
  m_bShowAdvice = 0;
  const int second = m_handPlayer.GetCard(1);
  m_handPlayer.RemoveCard(second);
  m_handSplit.AddCard(second);
  m_handPlayer.AddCard(NextCard());
  m_handSplit.AddCard(NextCard());
  m_strPlayerScore = TotalText(m_handPlayer);
  m_strSplitScore = TotalText(m_handSplit);
  Repaint();
}

void CFeltsideView::RaiseBet() {
  if (m_nBet < m_dWallet) m_nBet += kBetStep;
}

void CFeltsideView::LowerBet() {
  if (m_nBet > kBetStep) m_nBet -= kBetStep;
}

}  // namespace feltside
