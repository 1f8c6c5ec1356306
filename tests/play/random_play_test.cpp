// Long random play, at the table and in the dialogs: nothing a person may do breaks it, the money
// is always right, and every dialog can be left.

#include <gtest/gtest.h>

#include <array>
#include <cstdlib>
#include <map>
#include <memory>
#include <random>

#include "stylus/stylus_words.h"
#include "tests/play/table_model.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

constexpr int kCommands = 5000;
constexpr int kLeaveEvery = 200;  ///< commands until all dialogs are left
constexpr int kListenEvery = 7;   ///< commands until it is heard what was said
constexpr int kMostEscapes = 6;

using Texts = std::vector<std::string>;

/// A person without a plan, the same one for the same seed.
class Player {
 public:
  explicit Player(unsigned seed) : m_random(seed) {}

  std::string NextCommand(const Json& state) {
    return state["windows"].size() == 1 ? AtTheTable(state) : AtADialog(state["controls"]);
  }
  std::string RandomSettings();

 private:
  int Number(int from, int to) {
    return from + static_cast<int>(m_random() % unsigned(to - from + 1));
  }
  const std::string& OneOf(const Texts& texts) { return texts[m_random() % texts.size()]; }
  std::string Place(int width, int height) {
    return std::to_string(Number(-2, width + 2)) + " " + std::to_string(Number(-2, height + 2));
  }
  std::string Stack(bool poker);
  std::string AtTheTable(const Json& state);
  std::string AtADialog(const Json& controls);

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

std::string Player::AtTheTable(const Json& state) {
  static const Texts kMoves = {"command hit",    "command stand", "command split",
                               "command double", "command deal",  "command deal"};
  static const Texts kTargets = {"tap 90 160",  "tap 110 160", "tap 100 160", "tap 110 165",
                                 "tap 60 195",  "tap 190 195", "tap 180 118", "tap 100 200",
                                 "tap 120 185", "tap 54 130",  "tap 87 130",  "tap 120 130",
                                 "tap 153 130", "tap 186 130"};
  static const Texts kKeys = {"key H", "key S", "key D",   "key P",     "key I",     "key N",
                              "key B", "key +", "key -",   "key 1",     "key 2",     "key 3",
                              "key 4", "key 5", "key F10", "key Enter", "key Space", "key Alt+B"};
  static const Texts kDialogs = {"command game-setup", "command table-setup", "command scores",
                                 "command about"};
  static const Texts kEnds = {"command exit", "close"};
  static const Texts kMalformed = {"hit",         "tap",     "tap x y",   "stack 99",
                                   "wallet much", "key Hit", "clock now", "press 1 2"};
  const bool poker = state["m_nGameType"] == 1;
  const bool shortOfCards = state["m_bHandInProgress"] == 0 && CardsLeft(state) < 10;
  if (shortOfCards && (poker || Number(0, 4) > 0)) {
    return Number(0, 3) == 0 ? "key Ctrl+N" : Stack(poker);
  }
  const int choice = Number(0, 99);
  if (choice < 30) return OneOf(kMoves);
  if (choice < 53) return OneOf(kTargets);
  if (choice < 68) return OneOf(kKeys);
  if (choice < 76) return "tap " + Place(240, 268);
  if (choice < 82) return "touch " + Place(240, 40);
  if (choice < 89) return Stack(poker);
  if (choice < 94) return OneOf(kDialogs);
  if (choice < 96) return OneOf(kMalformed);
  if (choice < 97) return "clock 20" + std::to_string(Number(10, 99)) + "-02-28T23:59:58";
  if (choice < 98) return "type H";
  if (choice < 99) return "wallet " + std::to_string(Number(-400, 4000) / 2.0);
  return Number(0, 3) == 0 ? OneOf(kEnds) : "state";
}

std::string Player::AtADialog(const Json& controls) {
  static const Texts kKeys = {
      "Tab", "Shift+Tab", "Up",         "Down",   "Left",      "Right",  "Home",
      "End", "PageUp",    "PageDown",   "Space",  "Enter",     "Escape", "F1",
      "F4",  "Delete",    "Shift+Home", "Ctrl+A", "Backspace", "Ctrl+C", "Ctrl+V",
      "Y",   "S",         "B",          "G",      "Alt+Down",  "Ctrl+X", "Shift+Left"};
  static const Texts kTyped = {"x",
                               " y ",
                               "\u00E9\u20AC",
                               "\U0001F600",
                               "\u05E9\u05DC",
                               "\"\\=[]",
                               "a name longer than the box"};
  const int choice = Number(0, 99);
  if (choice < 10) return "touch " + Place(240, 294);
  // Where there is little to work with, it is soon left.
  if (choice < 35 || controls.size() < 3) return "key " + OneOf(kKeys);
  if (choice < 43) return "type " + OneOf(kTyped);
  const Json& control = controls[m_random() % controls.size()];
  const std::string number = std::to_string(control["number"].get<int>());
  const Json& rect = control["rect"];
  if (choice < 52) return "select " + number + " " + std::to_string(Number(-1, 12));
  if (choice < 61) return "slide " + number + " " + std::to_string(Number(-1, 256));
  if (choice > 70) return "press " + number;
  return "touch " + std::to_string(Number(rect[0], rect[2])) + " " +
         std::to_string(Number(rect[1], rect[3]));
}

std::string Player::RandomSettings() {
  std::string text = "[Settings]\n";
  for (const char* name : {"GAME_TYPE", "STRATTYPE", "NUMDECKS", "PLAYSPEED", "FANCYVP", "FANCYBJ",
                           "VIDEODISCARDS", "USEHIGH"}) {
    text +=
        name + (" = " + std::to_string(Number(0, 5) == 0 ? Number(-1, 6) : Number(0, 1))) + "\n";
  }
  return text + "CARDBACK = " + std::to_string(Number(53, 66)) + "\nHigh0 = 'Ann 500'\n";
}

/// A table and the second opinion on it.
struct Table {
  explicit Table(const std::string& profile) : stylus(profile) {}
  Stylus stylus;
  Json state = stylus.Send("state");
  TableModel model{state};
};

/// Gives one command; returns whether the program still runs.
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

constexpr unsigned kFirstSeed = 1;
constexpr unsigned kSecondSeed = 2;

/// Whatever is said ends with what may be done by then. Returns what is said or missing wrongly.
std::string WrongWords(const std::string& words, const Json& state) {
  const auto may = [&state](const char* command) -> bool {
    return state["enabled"][std::to_string(ToCommand(command))];
  };
  for (const auto& [phrase, expected] : std::vector<std::pair<std::string, bool>>{
           {"H to hit", may("hit")},
           {"S to stand", may("stand")},
           {"D to double down", may("double")},
           {"P to split", may("split")},
           {"I to take it", state["m_bInsuranceOffered"] == 1},
           {"Enter to play", state["m_bDrawPending"] == 1},
           {"Enter to deal", may("deal")}}) {
    if ((words.find(phrase) != std::string::npos) != expected) return phrase;
  }
  return {};
}

class RandomPlay : public testing::TestWithParam<unsigned> {};

/// One that nobody has seen before, or FELTSIDE_SEED, by which a failure is played again.
unsigned FreshSeed() {
  const char* given = std::getenv("FELTSIDE_SEED");
  return given == nullptr ? std::random_device()()
                          : static_cast<unsigned>(std::strtoul(given, nullptr, 10));
}

TEST_P(RandomPlay, KeepsTheTableInOrder) {
  std::printf("FELTSIDE_SEED=%u plays this again\n", GetParam());
  Player player(GetParam());
  auto table = std::make_unique<Table>("");
  int settled = 0;
  std::map<std::string, int> seen;  // how often each window was the topmost
  for (int i = 0; i < kCommands && !HasFailure(); ++i) {
    std::string command = player.NextCommand(table->state);
    if (i % kLeaveEvery == 0) {
      for (int key = 0; key < kMostEscapes && table->state["windows"].size() > 1; ++key) {
        PlayOn(*table, "key Escape");
      }
      EXPECT_TRUE(table->state["windows"].size() == 1 || !table->state["running"]);
      WriteFile(table->stylus.ProfileFile(), player.RandomSettings());
      command = "key Ctrl+N";
    }
    const bool runs = table->state["running"] && PlayOn(*table, command);
    if (runs && i % kListenEvery == 0 && table->state["windows"].size() == 1) {
      const std::string words = table->stylus.Send("words")["words"];
      EXPECT_EQ(WrongWords(words, table->state), "") << words;
    }
    ++seen[table->state["windows"].empty() ? "" : table->state["windows"].back()];
    if (runs) continue;
    settled += table->model.Settled();
    const std::string profile = ReadFile(table->stylus.ProfileFile());
    table = std::make_unique<Table>(profile);
  }
  // That it comes everywhere is known of these seeds only.
  if (GetParam() != kFirstSeed && GetParam() != kSecondSeed) return;
  EXPECT_GT(settled + table->model.Settled(), kCommands / 100);
  for (const char* title : {"Feltside", "BlackJack", "Setup", "Setup Table", "Edit RGB Color",
                            "High Scores", "About Feltside"}) {
    EXPECT_GT(seen[title], kCommands / 500) << title;
  }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomPlay,
                         testing::Values(kFirstSeed, kSecondSeed, FreshSeed(), FreshSeed()));

}  // namespace
}  // namespace feltside::tests
