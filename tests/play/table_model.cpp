#include "tests/play/table_model.h"

#include <algorithm>
#include <array>
#include <map>
#include <set>
#include <vector>

#include "stylus/stylus_words.h"

namespace feltside::tests {
namespace {

using Cards = std::vector<int>;

int Total(const Cards& cards) {
  int hard = 0;
  bool ace = false;
  for (const int card : cards) {
    if (card < 1) continue;
    const int rank = card % 13;
    hard += rank == 0 || rank > 10 ? 10 : rank;
    ace = ace || rank == 1;
  }
  return ace && hard <= 11 ? hard + 10 : hard;
}

/// What a hand of five cards returns, by the shape of its ranks. Cards that were stacked for the
/// other game may be five of a rank, which are four and one more.
int PokerReturn(const Cards& cards) {
  std::array<int, 15> count{};
  std::set<int> suits;
  for (const int card : cards) {
    ++count[static_cast<std::size_t>(card % 13 == 0 ? 13 : card % 13)];
    suits.insert((card - 1) / 13);
  }
  count[14] = count[1];
  bool straight = false;
  for (std::size_t low = 1; low <= 10; ++low) {
    straight = straight || std::all_of(count.begin() + static_cast<long>(low),
                                       count.begin() + static_cast<long>(low) + 5,
                                       [](int n) { return n == 1; });
  }
  const auto has = [&count](int n) { return std::count(count.begin(), count.end() - 1, n); };
  if (straight && suits.size() == 1) return count[10] == 1 && count[1] == 1 ? 250 : 50;
  if (has(4) + has(5) == 1) return 20;
  if (has(3) == 1 && has(2) == 1) return 7;
  if (suits.size() == 1) return 5;
  if (straight) return 4;
  return has(3) == 1 ? 3 : has(2) == 2 ? 2 : 0;
}

double HandMoney(const Cards& hand, const Cards& dealer, int stake) {
  const int mine = Total(hand);
  const int theirs = Total(dealer);
  if (mine > 21) return -stake;
  if (theirs > 21 || mine > theirs) return stake;
  return mine < theirs ? -stake : 0;
}

bool IsPair(const Cards& hand) {
  return hand.size() == 2 && hand[0] > 0 && hand[0] % 13 == hand[1] % 13;
}

/// The commands that may run, by the flags of the state.
std::string WrongCommands(const Json& s) {
  const bool playing = s["m_nGameType"] == 0 && s["m_bHandInProgress"] == 1 &&
                       s["m_bInsuranceOffered"] == 0 && s["windows"].size() == 1;
  const Json& active = s[s["m_bPlayingSplit"] == 1 ? "m_handSplit" : "m_handPlayer"];
  const bool split = !s["m_handSplit"].empty();
  const std::map<std::string, bool> expected = {
      {"hit", playing && active.size() < 12},
      {"stand", playing},
      {"double", playing && active.size() <= 2},
      {"split", playing && !split && IsPair(s["m_handPlayer"])},
      {"deal", s["m_bHandInProgress"] == 0 && s["windows"].size() == 1}};
  for (const auto& [command, enabled] : expected) {
    if (s["windows"].size() == 1 &&
        s["enabled"].at(std::to_string(ToCommand(command))) != enabled) {
      return command + (enabled ? " is disabled\n" : " is enabled\n");
    }
  }
  return {};
}

std::string WrongFlags(const Json& s) {
  const auto is = [&s](const char* flag) { return s[flag] == 1; };
  const bool inProgress = is("m_bHandInProgress");
  const bool poker = s["m_nGameType"] == 1;
  const auto marks = std::count(s["m_bDiscard"].begin(), s["m_bDiscard"].end(), 1);
  const int bet = s["m_nBet"];
  std::string wrong;
  const auto check = [&wrong](bool holds, const char* what) {
    if (!holds) wrong += std::string(what) + "\n";
  };
  check(!is("m_bPlayingSplit") || !s["m_handSplit"].empty(), "plays a split hand without cards");
  check(!is("m_bInsuranceOffered") || inProgress, "asks about insurance between hands");
  check(!is("m_bDoubledSplit") || !s["m_handSplit"].empty(), "doubled a hand that is not there");
  check(!is("m_bDoubledPlayer") || s["m_handPlayer"].size() <= 3, "took more after a double down");
  check(is("m_bDrawPending") == (inProgress && poker), "waits for a draw at the wrong time");
  check(bet >= 5 && bet % 5 == 0, "has an impossible stake");
  check(is("m_pTitleBitmap") == is("m_bShowTitle"), "has the title picture at the wrong time");
  for (const char* hand : {"m_handPlayer", "m_handSplit", "m_handDealer", "m_handPoker"}) {
    check(std::all_of(s[hand].begin(), s[hand].end(),
                      [](const Json& c) { return c >= 1 && c <= 52; }),
          "holds what is no card");
  }
  check(marks == 0 || is("m_bDrawPending"), "has marks between deals");
  check(s["m_handPlayer"].size() <= 12 && s["m_handSplit"].size() <= 12, "holds too many cards");
  check(s["m_handDealer"].size() <= 5, "gave the dealer a sixth card");
  check(s["m_handPoker"].size() == 5 || s["m_handPoker"].empty(), "has no five poker cards");
  check(!inProgress || poker || s["m_handDealer"].size() == 2, "dealt to the dealer too early");
  const auto within = [](const Json& value, int least, int most) {
    return value >= least && value <= most;
  };
  check(within(s["m_nGameType"], 0, 1) && within(s["m_nStrategyMode"], 0, 2) &&
            within(s["m_nDeckChoice"], 0, 2) && within(s["m_nMaxDiscards"], 0, 5) &&
            within(s["m_nDealerDelay"], 200, 2000) &&
            within(s["m_layout"]["m_nCardBackID"], 54, 65) &&
            within(s["m_layout"]["m_crTable"], 0, 0xFFFFFF),
        "has a setting out of its range");
  return wrong;
}

}  // namespace

const char* SelectedShoe(const Json& state) {
  const std::array<const char*, 3> shoes = {"m_deck1", "m_shoe4", "m_shoe6"};
  return shoes[state["m_nDeckChoice"].get<std::size_t>()];
}

/// Only a deal takes cards while no hand is in progress; one that runs out of them begins a shoe
/// anew.
bool TableModel::WasDealt(const std::string& command, const Json& state) const {
  if (command.rfind("stack", 0) == 0 || m_before["m_bHandInProgress"] == 1) return false;
  const Json& shoe = state[SelectedShoe(state)];
  return state["m_nGameType"] == 0 && shoe["position"] > 0 && shoe != m_before[SelectedShoe(state)];
}

double TableModel::BlackjackMoney(const Json& state, bool dealt) const {
  const int bet = m_before["m_nBet"];
  const bool asked = m_before["m_bInsuranceOffered"] == 1 && state["m_bInsuranceOffered"] == 0;
  const double insurance = asked && state["m_bInsuranceTaken"] == 1 ? -0.5 * bet : 0.0;
  if (state["m_bHandInProgress"] == 1) return insurance;
  const Cards player = state["m_handPlayer"];
  const Cards split = state["m_handSplit"];
  const Cards dealer = state["m_handDealer"];
  if (asked && insurance < 0) return insurance;
  if (dealt && Total(player) == 21) return 1.5 * bet;
  const auto stake = [&](const char* doubled) { return state[doubled] == 1 ? 2 * bet : bet; };
  double money = HandMoney(player, dealer, stake("m_bDoubledPlayer"));
  if (!split.empty()) money += HandMoney(split, dealer, stake("m_bDoubledSplit"));
  return money;
}

double TableModel::PokerMoney(const Json& state) const {
  const bool pendingBefore = m_before["m_bDrawPending"] == 1;
  const bool pending = state["m_bDrawPending"] == 1;
  if (pendingBefore == pending) return 0;
  return pending ? -1 : PokerReturn(state["m_handPoker"]);
}

std::string TableModel::Next(const std::string& command, const Json& state) {
  std::string wrong = WrongFlags(state) + WrongCommands(state);
  const bool wasInProgress = m_before["m_bHandInProgress"] == 1;
  const bool dealt = WasDealt(command, state);
  if (command.rfind("wallet ", 0) == 0) {
    m_dWallet = state["m_dWallet"];
  } else if (m_before["m_nGameType"] == 0 ? wasInProgress || dealt : dealt) {
    m_dWallet += BlackjackMoney(state, dealt);
  }
  m_dWallet += PokerMoney(state);
  if (m_dWallet != state["m_dWallet"]) {
    wrong += "the wallet should hold " + std::to_string(m_dWallet) + "\n";
  }
  if (wasInProgress && state["m_nBet"] != m_before["m_nBet"]) wrong += "changed a running stake\n";
  if ((wasInProgress || dealt) && state["m_bHandInProgress"] == 0) ++m_nSettled;
  m_before = state;
  return wrong;
}

}  // namespace feltside::tests
