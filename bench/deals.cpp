// Plays blackjack by the adviser inside one process, with nothing drawn: feltside-deals DECKS DEALS
//
// Says what a deal brings on the average, in stakes, and the standard error of that.

#include <chrono>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>

#include "engine/advice.h"
#include "platform/host/offscreen_host.h"
#include "shell/feltside_app.h"
#include "stylus/table_state.h"
#include "table/command_ids.h"

namespace feltside {
namespace {

constexpr double kStake = 5;
const std::map<std::string, int> kDeckChoices = {{"1", 0}, {"4", 1}, {"6", 2}};

class AdvisedPlayer {
 public:
  AdvisedPlayer(platform::OffscreenHost& host, long deals) : m_host(host), m_nDeals(deals) {
    m_host.SetIdleHandler([this] { return Move(); });
  }

  void Report(double seconds) const {
    const auto deals = static_cast<double>(m_nDealt);
    const double mean = m_dSum / deals;
    const double variance = (m_dSquares / deals - mean * mean) * deals / (deals - 1);
    std::cout << m_nDealt << " deals, " << static_cast<long>(deals / seconds) << " a second: mean "
              << mean << " stakes, standard error " << std::sqrt(variance / deals) << '\n';
  }

 private:
  static bool Can(int commandID) {
    return platform::TheApp().MainFrame()->IsCommandEnabled(commandID);
  }
  static CTableState Table() {
    return CTableState(static_cast<CFeltsideView&>(platform::TheApp().MainFrame()->View()));
  }

  /// One move; false: there are enough deals.
  bool Move() {
    platform::TheApp().MainFrame()->View().ShowWindow(false);
    if (Can(kCommandDeal)) return Deal();
    if (Can(kCommandStand)) {
      platform::TheApp().Queue().PostCommand(Advised());
    } else {
      platform::InputEvent no;
      no.kind = platform::InputKind::kKey;
      no.stroke = platform::ParseChord("N").value();
      m_host.PutInput(no);
    }
    return true;
  }

  bool Deal() {
    const double wallet = Table().Wallet();
    if (m_nDealt >= 0) Count((wallet - m_dWallet) / kStake);
    m_dWallet = wallet;
    if (++m_nDealt == m_nDeals) return false;
    platform::TheApp().Queue().PostCommand(kCommandDeal);
    return true;
  }

  void Count(double stakes) {
    m_dSum += stakes;
    m_dSquares += stakes * stakes;
  }

  static int Advised() {
    const CBlackjackHand& hand = Table().ActiveHand();
    std::string text;
    int advice = GetAdvice(hand, text, Table().UpCard());
    if (advice == ADVICE_SPLIT && !Can(kCommandSplit)) {
      advice = GetAdvice(AsNoPair(hand), text, Table().UpCard());
    }
    switch (advice) {
      case ADVICE_HIT:
        return kCommandHit;
      case ADVICE_SPLIT:
        return kCommandSplit;
      case ADVICE_DOUBLE:
        return kCommandDoubleDown;
      default:
        return kCommandStand;
    }
  }

  /// Two other cards of the same total, for a pair that cannot be split once more. Aces are as good
  /// as any hand that is always told to hit.
  static CBlackjackHand AsNoPair(const CBlackjackHand& pair) {
    const int rank = RankOf(pair.GetCard(0));
    CBlackjackHand hand;
    hand.AddCard(rank <= 2 ? 3 : rank - 1);
    hand.AddCard(rank <= 2 ? 2 : rank + 1);
    return hand;
  }

  platform::OffscreenHost& m_host;
  long m_nDeals;
  long m_nDealt = -1;  ///< the first move only begins
  double m_dWallet = 0;
  double m_dSum = 0;
  double m_dSquares = 0;
};

int Play(const std::string& decks, long deals) {
  const auto folder = std::filesystem::temp_directory_path() / ("feltside-deals-" + decks);
  std::filesystem::create_directories(folder / "Quillworks");
  std::ofstream(folder / "Quillworks" / "Feltside.toml")
      << "[Settings]\nPLAYSPEED = 2\nNUMDECKS = " << kDeckChoices.at(decks) << '\n';
  platform::OffscreenHost host(folder);
  platform::SetHost(&host);
  CFeltsideApp app;
  const AdvisedPlayer player(host, deals);
  const auto begin = std::chrono::steady_clock::now();
  const int exitCode = app.Main();
  const std::chrono::duration<double> time = std::chrono::steady_clock::now() - begin;
  std::cout << decks << " decks: ";
  player.Report(time.count());
  std::filesystem::remove_all(folder);
  return exitCode;
}

}  // namespace
}  // namespace feltside

int main(int argc, char** argv) {
  const long deals = argc == 3 ? std::atol(argv[2]) : 0;
  if (deals < 2 || feltside::kDeckChoices.count(argv[1]) == 0) {
    std::cerr << "usage: feltside-deals 1|4|6 DEALS\n";
    return EXIT_FAILURE;
  }
  return feltside::Play(argv[1], deals);
}
