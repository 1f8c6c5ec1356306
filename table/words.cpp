// The table in words, for whoever plays by ear. A phrase is told when it is new; the last one, what
// may be done, closes whatever is told.

#include <algorithm>
#include <cctype>
#include <cmath>

#include "engine/card_text.h"
#include "engine/poker.h"
#include "render/money_text.h"
#include "table/feltside_view.h"

namespace feltside {
namespace {

using platform::Phrases;

/// An amount with cents only where there are some; voices pass over a minus sign.
std::string Spoken(double dollars) {
  const std::string amount = MoneyText(std::abs(dollars), std::trunc(dollars) == dollars ? 0 : 2);
  return dollars < 0 ? "minus " + amount : amount;
}

std::string The(int card) { return "the " + CardName(card); }

/// "a", "a and b", "a, b and c".
std::string Listed(const Phrases& parts, const std::string& lastWord) {
  std::string text;
  for (std::size_t i = 0; i < parts.size(); ++i) {
    if (i > 0) text += i + 1 == parts.size() ? " " + lastWord + " " : ", ";
    text += parts[i];
  }
  return text;
}

/// Scores and results are totals or "Blackjack!", "Winner!" and the like.
bool IsNumber(const std::string& text) {
  return !text.empty() && std::isdigit(static_cast<unsigned char>(text[0])) != 0;
}

/// How a hand came about: its first two cards, then a phrase for each card drawn.
void AddHand(Phrases& words, const std::string& start, const std::string& draws,
             const CBlackjackHand& hand, const std::string& score) {
  CBlackjackHand soFar = hand;
  soFar.Clear();
  for (int slot = 0; slot < hand.GetCount(); ++slot) {
    soFar.AddCard(hand.GetCard(slot));
    if (slot == 0) continue;
    const std::string cards = slot == 1 ? start : draws + The(hand.GetCard(slot));
    const bool natural = !score.empty() && !IsNumber(score);
    words.push_back(cards + ", " + (natural ? score : "total " + std::to_string(soFar.GetTotal())));
  }
}

std::string FirstTwo(const CBlackjackHand& hand) {
  return The(hand.GetCard(0)) + " and " + The(hand.GetCard(1));
}

/// A total is told with the cards.
void AddResult(Phrases& words, const std::string& owner, const std::string& result) {
  if (!result.empty() && !IsNumber(result)) words.push_back(owner + result);
}

}  // namespace

Phrases CFeltsideView::Words() const {
  const bool poker = m_nGameType == kGameVideoPoker;
  Phrases words = poker ? VideoPokerWords() : BlackjackWords();
  if (m_bShowTitle != 0) {
    words.insert(words.begin(), {poker ? "Feltside, video poker" : "Feltside, blackjack",
                                 "F10 for the menu, F1 for help"});
  }
  return words;
}

Phrases CFeltsideView::BlackjackWords() const {
  Phrases words;
  AddPlayerHands(words);
  if (m_handDealer.GetCount() > 0) words.push_back("The dealer shows " + The(UpCard()));
  if (m_bInsuranceTaken != 0) words.emplace_back("Insurance taken");
  if (m_bHandInProgress == 0) {
    words.push_back(VerdictWords());
    AddHand(words, "The dealer turns over " + The(m_handDealer.GetCard(0)), "The dealer draws ",
            m_handDealer, m_strDealerScore);
  }
  AddResult(words, IsSplit() ? "Left hand: " : "", m_strPlayerMsg);
  AddResult(words, "Right hand: ", m_strSplitMsg);
  words.push_back("Bet " + Spoken(m_nBet));
  words.push_back("Wallet " + Spoken(m_dWallet));
  words.push_back(BlackjackChoices());
  return words;
}

void CFeltsideView::AddPlayerHands(Phrases& words) const {
  if (IsSplit()) {
    AddHand(words, "Left hand: " + FirstTwo(m_handPlayer), "Left hand draws ", m_handPlayer, "");
    AddHand(words, "Right hand: " + FirstTwo(m_handSplit), "Right hand draws ", m_handSplit, "");
  } else {
    AddHand(words, "You have " + FirstTwo(m_handPlayer), "You draw ", m_handPlayer,
            m_strPlayerScore);
  }
}

std::string CFeltsideView::VerdictWords() const {
  if (m_nStrategyMode != kStrategyButton || m_bShowVerdict == 0) return {};
  return m_bVerdictCorrect != 0 ? "Right move" : "Wrong move";
}

std::string CFeltsideView::BlackjackChoices() const {
  if (m_bHandInProgress == 0) return "Enter to deal, plus and minus for the bet";
  std::string text = VerdictWords();
  const auto add = [&text](const std::string& phrase) {
    text += (text.empty() ? "" : ". ") + phrase;
  };
  if (IsSplit()) add(m_bPlayingSplit != 0 ? "You play the right hand" : "You play the left hand");
  if (const std::string advice = AdviceText(); IsAdviceShown() && !advice.empty()) {
    add("The adviser says " + advice);
  }
  add(Moves());
  return text;
}

std::string CFeltsideView::Moves() const {
  Phrases moves;
  if (m_bInsuranceOffered != 0) moves = {"Insurance? I to take it", "N to decline it"};
  if (CanHit()) moves.emplace_back("H to hit");
  if (CanStand()) moves.emplace_back("S to stand");
  if (CanDoubleDown()) moves.emplace_back("D to double down");
  if (CanSplit()) moves.emplace_back("P to split");
  if (IsStrategyButtonLive()) moves.emplace_back("B for advice");
  return Listed(moves, "or");
}

Phrases CFeltsideView::VideoPokerWords() const {
  Phrases cards;
  for (int slot = 0; slot < m_handPoker.GetCount(); ++slot) {
    cards.push_back(std::to_string(slot + 1) + " " + CardName(m_handPoker.GetCard(slot)));
  }
  Phrases words = {Listed(cards, "and")};
  if (m_bDrawPending != 0) {
    words.push_back("1 to 5 to let up to " + std::to_string(m_nMaxDiscards) + " cards go");
  } else if (!cards.empty()) {
    std::string name;
    const int dollars = ScorePoker(m_handPoker, name);
    words.push_back(name + ", pays " + (dollars > 0 ? Spoken(dollars) : "nothing"));
  }
  words.push_back("Wallet " + Spoken(m_dWallet));
  words.push_back(m_bDrawPending != 0 ? MarkWords() + ". Enter to play" : "Enter to deal");
  return words;
}

std::string CFeltsideView::MarkWords() const {
  Phrases held;
  for (std::size_t slot = 0; slot < m_bDiscard.size(); ++slot) {
    if (m_bDiscard[slot] == 0) held.push_back(std::to_string(slot + 1));
  }
  if (held.empty()) return "You hold none";
  const bool noMore = kPokerCards - static_cast<int>(held.size()) >= m_nMaxDiscards;
  return "You hold " + (held.size() == kPokerCards ? "all" : Listed(held, "and")) +
         (noMore ? ", no more may go" : "");
}

}  // namespace feltside
