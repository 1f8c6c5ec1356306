// Long random play: nothing a person may do at the table breaks it, and the money is always right.

#include <gtest/gtest.h>

#include <array>
#include <memory>
#include <random>

#include "tests/play/table_model.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

constexpr int kCommands = 50000;

/// A person without a plan, the same one for the same seed.
class Player {
 public:
  explicit Player(unsigned seed) : m_random(seed) {}

  std::string NextCommand(const Json& state);
  std::string RandomSettings();

 private:
  int Number(int from, int to) {
    return from + static_cast<int>(m_random() % unsigned(to - from + 1));
  }
  template <std::size_t count>
  std::string OneOf(const std::array<const char*, count>& texts) {
    return texts[m_random() % count];
  }
  std::string Place(int width, int height) {
    return std::to_string(Number(-2, width + 2)) + " " + std::to_string(Number(-2, height + 2));
  }
  std::string Stack(bool poker);

  std::mt19937 m_random;
};

std::string Player::Stack(bool poker) {
  // Now and then only a few cards are left, so that a hand runs out of them.
  const int count = poker ? 10 : Number(0, 3) == 0 ? Number(4, 8) : 15;
  // Few ranks make pairs, naturals and insurance common; one suit makes flushes.
  const int ranks = Number(0, 1) == 0 ? 13 : 5;
  std::string command = "stack";
  std::array<bool, 53> used{};
  for (int i = 0; i < count;) {
    const int rank = ranks == 13 ? Number(1, 13) : std::array{1, 8, 10, 12, 13}[m_random() % 5];
    const int card = rank + 13 * Number(0, 3);
    if (poker && used[static_cast<std::size_t>(card)]) continue;
    used[static_cast<std::size_t>(card)] = true;
    command += " " + std::to_string(card);
    ++i;
  }
  return command;
}

/// In the shoe that the next deal uses; a stacked one is not shuffled by itself any more.
int CardsLeft(const Json& state) {
  const Json& shoe = state[state["m_nGameType"] == 1 ? "m_deck1" : SelectedShoe(state)];
  return shoe["count"].get<int>() - shoe["position"].get<int>();
}

std::string Player::NextCommand(const Json& state) {
  static constexpr std::array kMoves = {"command 32771", "command 32772", "command 32773",
                                        "command 32775", "command 32776", "command 32776"};
  static constexpr std::array kTargets = {
      "tap 90 160",  "tap 110 160", "tap 100 160", "tap 110 165", "tap 60 195",
      "tap 190 195", "tap 180 118", "tap 100 200", "tap 120 185", "tap 54 130",
      "tap 87 130",  "tap 120 130", "tap 153 130", "tap 186 130"};
  static constexpr std::array kKeys = {
      "key H",     "key S",      "key D",     "key P",     "key I",     "key N",
      "key B",     "key +",      "key -",     "key 1",     "key 2",     "key 3",
      "key 4",     "key 5",      "key Enter", "key Space", "key Tab",   "key F10",
      "key Alt+B", "key Escape", "key Down",  "key Up",    "key Alt+H", "key F4"};
  static constexpr std::array kMalformed = {"hit",         "tap",     "tap x y",   "stack 99",
                                            "wallet much", "key Hit", "clock now", "press 1 2"};
  const bool poker = state["m_nGameType"] == 1;
  const bool shortOfCards = state["m_bHandInProgress"] == 0 && CardsLeft(state) < 10;
  if (shortOfCards && (poker || Number(0, 4) > 0)) {
    return Number(0, 3) == 0 ? "key Ctrl+N" : Stack(poker);
  }
  const int choice = Number(0, 99);
  if (choice < 30) return OneOf(kMoves);
  if (choice < 55) return OneOf(kTargets);
  if (choice < 70) return OneOf(kKeys);
  if (choice < 78) return "tap " + Place(240, 268);
  if (choice < 84) return "touch " + Place(240, 40);
  if (choice < 86) return "touch " + Place(240, 294);
  if (choice < 93) return Stack(poker);
  if (choice < 95) return OneOf(kMalformed);
  if (choice < 96) return "clock 20" + std::to_string(Number(10, 99)) + "-02-28T23:59:58";
  if (choice < 97) return "type H";
  if (choice < 98) return "wallet " + std::to_string(Number(-400, 4000) / 2.0);
  return Number(0, 40) == 0 ? "close" : "state";
}

std::string Player::RandomSettings() {
  std::string text;
  for (const char* name : {"GAME_TYPE", "STRATTYPE", "NUMDECKS", "PLAYSPEED", "FANCYVP", "FANCYBJ",
                           "VIDEODISCARDS", "USEHIGH"}) {
    text +=
        name + (" = " + std::to_string(Number(0, 5) == 0 ? Number(-1, 6) : Number(0, 1))) + "\n";
  }
  return text + "CARDBACK = " + std::to_string(Number(53, 66)) + "\n";
}

/// A table and the second opinion on it.
struct Table {
  Stylus stylus;
  Json state = stylus.Send("state");
  TableModel model{state};
};

/// Gives one command; answers whether the program still runs.
bool PlayOn(Table& table, const std::string& command) {
  Json answer = table.stylus.Send(command);
  if (answer.contains("error")) {
    EXPECT_EQ(Missing(table.stylus.Send("state"), table.state), "") << "after " << command;
    return true;
  }
  const std::string wrong = table.model.Next(command, answer);
  EXPECT_EQ(wrong, "") << "after " << command << "\n" << Missing(answer, table.state);
  answer.erase("refused");
  table.state = answer;
  return answer["running"];
}

class RandomPlay : public testing::TestWithParam<unsigned> {};

TEST_P(RandomPlay, KeepsTheTableInOrder) {
  Player player(GetParam());
  auto table = std::make_unique<Table>();
  int settled = 0;
  for (int i = 0; i < kCommands && !HasFailure(); ++i) {
    const Json& windows = table->state["windows"];
    std::string command = player.NextCommand(table->state);
    // Dialogs are left alone; the menu is played with.
    if (windows.size() > 1 && windows.back() != "BlackJack") command = "key Escape";
    const bool between = table->state["m_bHandInProgress"] == 0 && windows.size() == 1;
    if (between && i % 200 == 0) {
      table->stylus.SetSettings(player.RandomSettings());
      command = "key Ctrl+N";
    }
    if (PlayOn(*table, command)) continue;
    settled += table->model.Settled();
    table = std::make_unique<Table>();
  }
  EXPECT_GT(settled + table->model.Settled(), kCommands / 25);
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomPlay, testing::Values(1U, 2U));

}  // namespace
}  // namespace feltside::tests
