// The setup dialogs where their values cannot be kept.

#include <gmock/gmock.h>

#include "tests/support/script.h"

namespace feltside::tests {
namespace {

TEST(Setup, WritesInItsOrderAndHoldsForTheRunWhenItCannotBeKept) {
  Stylus stylus;
  stylus.Send("state");
  // Where the new file is to be written.
  std::filesystem::create_directories(stylus.ProfileFile().string() + ".new");
  for (const char* command : {"command game-setup", "select 1008 2", "select 1007 0", "press 1"}) {
    Do(stylus, command);
  }
  for (const char* command : {"command table-setup", "press 1014", "press 1"}) Do(stylus, command);
  EXPECT_EQ(Missing(stylus.Send("command deal"),
                    {{"m_nStrategyMode", 2}, {"m_nDealerDelay", 2000}, {"m_bFancyBlackjack", 0}}),
            "");
  std::vector<std::string> lost;
  std::istringstream lines(stylus.Errors());
  for (std::string line; std::getline(lines, line);) {
    if (line.rfind("Not stored: ", 0) == 0) lost.push_back(line);
  }
  EXPECT_THAT(lost, testing::ElementsAre(
                        "Not stored: STRATTYPE GAME_TYPE NUMDECKS PLAYSPEED",
                        "Not stored: TABLECOLOR BOXCOLOR CARDBACK VIDEODISCARDS FANCYVP FANCYBJ "
                        "USEHIGH"));
}

}  // namespace
}  // namespace feltside::tests
