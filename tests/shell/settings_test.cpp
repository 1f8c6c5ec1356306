// The eleven settings: what each is worth when it is loaded, and that the dialogs store each as its
// own.

#include <gtest/gtest.h>

#include <array>

#include "tests/support/stylus.h"

namespace feltside::tests {
namespace {

struct Setting {
  std::string name;
  std::string member;  ///< of the state
  int lowest, highest, absent;
};

const std::vector<Setting> kSettings = {
    {"BOXCOLOR", "/m_layout/m_crBox", 0, 0xFFFFFF, 6599815},
    {"CARDBACK", "/m_layout/m_nCardBackID", 54, 65, 54},
    {"FANCYBJ", "/m_bFancyBlackjack", 0, 1, 1},
    {"FANCYVP", "/m_bFancyPoker", 0, 1, 1},
    {"GAME_TYPE", "/m_nGameType", 0, 1, 0},
    {"NUMDECKS", "/m_nDeckChoice", 0, 2, 1},
    {"PLAYSPEED", "/m_nDealerDelay", 0, 2, 1},
    {"STRATTYPE", "/m_nStrategyMode", 0, 2, 1},
    {"TABLECOLOR", "/m_layout/m_crTable", 0, 0xFFFFFF, 39680},
    {"USEHIGH", "/m_bUseHighScores", 0, 1, 1},
    {"VIDEODISCARDS", "/m_nMaxDiscards", 0, 5, 3},
};

/// What the member holds for a value that is in range.
int Held(const Setting& setting, int value) {
  constexpr std::array<int, 3> kDelays = {2000, 1000, 200};
  return setting.name == "PLAYSPEED" ? kDelays.at(static_cast<std::size_t>(value)) : value;
}

TEST(Settings, HoldWhatIsInRangeAndTheirDefaultsElse) {
  Stylus stylus;
  for (const Setting& setting : kSettings) {
    const int less = setting.lowest - 1;
    const int more = setting.highest + 1;
    for (const int value : {setting.lowest, setting.highest, setting.absent, less, more}) {
      WriteFile(stylus.ProfileFile(),
                "[Settings]\n" + setting.name + " = " + std::to_string(value));
      const Json state = stylus.Send("key Ctrl+N");
      for (const Setting& each : kSettings) {
        const bool isHeld = each.name == setting.name && value != less && value != more;
        EXPECT_EQ(state.at(Json::json_pointer(each.member)),
                  Held(each, isHeld ? value : each.absent))
            << each.name << " with " << setting.name << " = " << value;
      }
    }
  }
}

TEST(Settings, AreStoredEachAsItsOwn) {
  for (const Setting& setting : kSettings) {
    const int value = setting.highest != setting.absent ? setting.highest : setting.lowest;
    Stylus stylus("[Settings]\n" + setting.name + " = " + std::to_string(value));
    for (const char* command :
         {"command game-setup", "press 1", "command table-setup", "press 1"}) {
      stylus.Send(command);
    }
    std::string stored = "[Settings]\n";
    for (const Setting& each : kSettings) {
      stored += each.name + " = " + std::to_string(&each == &setting ? value : each.absent) + "\n";
    }
    EXPECT_EQ(ReadFile(stylus.ProfileFile()), stored);
  }
}

TEST(Settings, AreNotLostToTheDefaultsOfAFileThatCouldNotBeRead) {
  Stylus stylus;
  std::filesystem::create_directories(stylus.ProfileFile());
  stylus.Send("key Ctrl+N");
  stylus.Send("press 1");  // the box that tells
  std::filesystem::remove(stylus.ProfileFile());
  std::string stored = "[Settings]\n";
  for (const Setting& each : kSettings) {
    stored += each.name + " = " + std::to_string(each.lowest) + "\n";
  }
  WriteFile(stylus.ProfileFile(), stored);
  stylus.Send("command table-setup");
  const Json state = stylus.Send("press 1");
  for (const Setting& each : kSettings) {
    EXPECT_EQ(state.at(Json::json_pointer(each.member)), Held(each, each.lowest)) << each.name;
  }
}

}  // namespace
}  // namespace feltside::tests
