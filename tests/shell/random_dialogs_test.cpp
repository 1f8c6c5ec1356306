// Long random play with every dialog and control: nothing breaks, and every dialog can be left.

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <random>

#include "tests/support/script.h"

namespace feltside::tests {
namespace {

constexpr int kCommands = 20000;
constexpr int kLeaveEvery = 500;
constexpr int kMostEscapes = 6;

/// A person without a plan, the same one every time.
class Player {
 public:
  std::string NextCommand(const Json& state);

 private:
  int Number(int from, int to) {
    return from + static_cast<int>(m_random() % unsigned(to - from + 1));
  }
  std::string OneOf(const std::vector<std::string>& texts) {
    return texts[m_random() % texts.size()];
  }
  std::string AtTheTable();
  std::string WithAControl(const Json& control);

  std::mt19937 m_random{42};
};

std::string Player::AtTheTable() {
  return OneOf({"command 32779", "command 32777", "command 32781", "command 57664", "command 57665",
                "command 32776", "command 32772", "key F10", "key Enter", "key N", "key H",
                "key Ctrl+N", "wallet " + std::to_string(Number(50, 900))});
}

std::string Player::WithAControl(const Json& control) {
  const std::string number = std::to_string(control["number"].get<int>());
  const Json& rect = control["rect"];
  switch (Number(0, 5)) {
    case 0:
      return "select " + number + " " + std::to_string(Number(-1, 12));
    case 1:
      return "slide " + number + " " + std::to_string(Number(-1, 256));
    case 2:
      return "touch " + std::to_string(Number(rect[0], rect[2])) + " " +
             std::to_string(Number(rect[1], rect[3]));
    default:
      return "press " + number;
  }
}

std::string Player::NextCommand(const Json& state) {
  const Json& controls = state["controls"];
  const int choice = Number(0, 99);
  if (choice < 10) {
    return "touch " + std::to_string(Number(0, 239)) + " " + std::to_string(Number(0, 293));
  }
  if (choice < 30) {
    return "key " +
           OneOf({"Tab",        "Shift+Tab", "Up",     "Down",     "Left",      "Right",
                  "Home",       "End",       "PageUp", "PageDown", "Space",     "Enter",
                  "Escape",     "F1",        "F4",     "Delete",   "Backspace", "Shift+Home",
                  "Shift+Left", "Ctrl+A",    "Ctrl+C", "Ctrl+V",   "Ctrl+X",    "Alt+Down",
                  "Y",          "S",         "B"});
  }
  if (choice < 38) {
    return "type " + OneOf({"x", " y ", "\u00E9\u20AC", "\U0001F600", "\u05E9\u05DC", "\"\\=[]",
                            "a name longer than the box"});
  }
  if (controls.empty() || choice < 42) return AtTheTable();
  return WithAControl(controls[m_random() % controls.size()]);
}

/// What of the settings is out of its range.
std::string WrongIn(const Json& state) {
  std::string wrong;
  const auto limit = [&wrong](const Json& value, int least, int most) {
    if (value < least || value > most) wrong += value.dump() + " ";
  };
  limit(state["m_nGameType"], 0, 1);
  limit(state["m_nStrategyMode"], 0, 2);
  limit(state["m_nDeckChoice"], 0, 2);
  limit(state["m_nDealerDelay"], 200, 2000);
  limit(state["m_nMaxDiscards"], 3, 5);
  limit(state["m_layout"]["m_nCardBackID"], 54, 65);
  limit(state["m_layout"]["m_crTable"], 0, 0xFFFFFF);
  return wrong;
}

TEST(RandomDialogs, CanAllBeLeft) {
  Player player;
  auto stylus = std::make_unique<Stylus>();
  Json state = stylus->Send("state");
  std::map<std::string, int> seen;
  const auto send = [&](const std::string& command) {
    const Json answer = stylus->Send(command);
    if (answer.contains("error")) return;
    state = answer;
    ++seen[state["windows"].back()];
    ASSERT_EQ(WrongIn(state), "") << "after " << command;
    if (state["running"]) return;
    const std::string profile = ReadFile(stylus->ProfileFile());
    stylus = std::make_unique<Stylus>(profile);
    state = stylus->Send("state");
  };
  for (int i = 1; i <= kCommands && !HasFailure(); ++i) {
    send(player.NextCommand(state));
    if (i % kLeaveEvery != 0) continue;
    for (int key = 0; key < kMostEscapes && state["windows"].size() > 1; ++key) send("key Escape");
    ASSERT_EQ(state["windows"].size(), 1U) << "after " << i;
  }
  for (const char* title : {"Feltside", "BlackJack", "Setup", "Setup Table", "Edit RGB Color",
                            "High Scores", "About Feltside", ""}) {
    EXPECT_GT(seen[title], kCommands / 200) << title;
  }
}

}  // namespace
}  // namespace feltside::tests
