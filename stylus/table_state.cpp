#include "stylus/table_state.h"

namespace feltside {
namespace {

using Json = nlohmann::ordered_json;

/// As many cards as the next deal takes without a shuffle.
constexpr std::size_t kMostBlackjackCards = 15;
constexpr std::size_t kMostPokerCards = 10;

Json ToJson(const CCardHand& hand) {
  Json cards = Json::array();
  for (int slot = 0; slot < hand.GetCount(); ++slot) cards.push_back(hand.GetCard(slot));
  return cards;
}

Json ToJson(const CShoe& shoe) {
  return {{"position", shoe.GetPosition()},
          {"count", shoe.GetCount()},
          {"shuffles", shoe.GetShuffles()}};
}

Json ToJson(const platform::Rect& rect) { return {rect.left, rect.top, rect.right, rect.bottom}; }

Json ToJson(const CTableLayout& layout) {
  return {{"m_rcTable", ToJson(layout.m_rcTable)},
          {"m_crTable", layout.m_crTable},
          {"m_crBox", layout.m_crBox},
          {"m_nCardBackID", layout.m_nCardBackID},
          {"m_nRowCards", layout.m_nRowCards},
          {"m_nFanCards", layout.m_nFanCards},
          {"m_nCardHeight", layout.m_nCardHeight},
          {"m_nCardWidth", layout.m_nCardWidth},
          {"m_nFanStepX", layout.m_nFanStepX},
          {"m_nFanStepY", layout.m_nFanStepY}};
}

/// A picture's pointer as a flag: whether it is loaded.
int IsLoaded(const std::unique_ptr<platform::CBitmap>& picture) { return picture ? 1 : 0; }

}  // namespace

Json CTableState::Read() const {
  const CFeltsideView& v = m_view;
  return {{"m_nGameType", v.m_nGameType},
          {"m_handPlayer", ToJson(v.m_handPlayer)},
          {"m_handSplit", ToJson(v.m_handSplit)},
          {"m_handDealer", ToJson(v.m_handDealer)},
          {"m_strPlayerMsg", v.m_strPlayerMsg},
          {"m_strSplitMsg", v.m_strSplitMsg},
          {"m_strDealerScore", v.m_strDealerScore},
          {"m_strPlayerScore", v.m_strPlayerScore},
          {"m_strSplitScore", v.m_strSplitScore},
          {"m_deck1", ToJson(v.m_deck1)},
          {"m_shoe4", ToJson(v.m_shoe4)},
          {"m_shoe6", ToJson(v.m_shoe6)},
          {"m_nDeckChoice", v.m_nDeckChoice},
          {"m_layout", ToJson(v.m_layout)},
          {"m_bShowTitle", v.m_bShowTitle},
          {"m_pTitleBitmap", IsLoaded(v.m_pTitleBitmap)},
          {"m_pTableBitmap", IsLoaded(v.m_pTableBitmap)},
          {"m_nStrategyMode", v.m_nStrategyMode},
          {"m_bShowAdvice", v.m_bShowAdvice},
          {"m_bDoubledPlayer", v.m_bDoubledPlayer},
          {"m_bDoubledSplit", v.m_bDoubledSplit},
          {"m_dWallet", v.m_dWallet},
          {"m_nBet", v.m_nBet},
          {"m_nDealerDelay", v.m_nDealerDelay},
          {"m_bHandInProgress", v.m_bHandInProgress},
          {"m_bUseHighScores", v.m_bUseHighScores},
          {"m_bPlayingSplit", v.m_bPlayingSplit},
          {"m_bFancyBlackjack", v.m_bFancyBlackjack},
          {"m_bInsuranceTaken", v.m_bInsuranceTaken},
          {"m_bInsuranceOffered", v.m_bInsuranceOffered},
          {"m_bShowVerdict", v.m_bShowVerdict},
          {"m_bVerdictCorrect", v.m_bVerdictCorrect},
          {"m_pPokerBitmap", IsLoaded(v.m_pPokerBitmap)},
          {"m_nMaxDiscards", v.m_nMaxDiscards},
          {"m_bFancyPoker", v.m_bFancyPoker},
          {"m_bDrawPending", v.m_bDrawPending},
          {"m_handPoker", ToJson(v.m_handPoker)},
          {"m_bDiscard", v.m_bDiscard}};
}

std::string CTableState::Stack(const std::vector<int>& cards) {
  const bool poker = m_view.m_nGameType == kGameVideoPoker;
  if (m_view.m_bHandInProgress != 0) return "a hand is in progress";
  if (cards.size() > (poker ? kMostPokerCards : kMostBlackjackCards)) return "too many cards";
  CShoe* shoe = poker ? &m_view.m_deck1 : m_view.SelectedShoe();
  if (shoe == nullptr) return "there is no shoe";
  shoe->StackTop(cards);
  return {};
}

}  // namespace feltside
