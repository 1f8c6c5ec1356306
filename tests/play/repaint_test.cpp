// Every change of the table is shown at once, and nothing is shown twice.

#include <gtest/gtest.h>

#include "table/command_ids.h"
#include "tests/support/desk.h"

namespace feltside::tests {
namespace {

/// Presses a key, which must bring new frames, each unlike the one before it.
void Press(Desk& desk, const std::string& key) {
  SCOPED_TRACE(key);
  platform::CBitmap last = desk.Host().Shown();
  int frames = 0;
  desk.Host().SetFrameHandler([&] {
    const platform::CBitmap& frame = desk.Host().Shown();
    EXPECT_FALSE(frame == last);
    last = frame;
    ++frames;
  });
  desk.Host().PutKey(key);
  desk.Run();
  desk.Host().SetFrameHandler({});
  EXPECT_GT(frames, 0);
}

TEST(Repaint, ShowsEachChangeAndNothingTwice) {
  struct Hand {
    std::string settings;
    std::vector<int> cards;
    std::vector<std::string> keys;
  };
  for (const Hand& hand :
       std::vector<Hand>{{"", {10, 8, 23, 15, 4, 5}, {"Enter", "B", "S", "+"}},
                         {"", {10, 8, 23, 15, 12}, {"Enter", "H"}},
                         {"", {10, 6, 23, 20, 5}, {"Enter", "H"}},
                         {"", {5, 6, 23, 15, 4, 5}, {"Enter", "D"}},
                         {"", {10, 6, 23, 20, 12}, {"Enter", "D"}},
                         {"", {10, 13, 23, 15}, {"Enter"}},
                         {"", {10, 8, 14, 23}, {"Enter"}},
                         {"", {10, 8, 20, 14}, {"Enter", "I", "S"}},
                         {"", {8, 21, 20, 14, 3, 10}, {"Enter", "N", "P", "D", "S"}},
                         {"GAME_TYPE = 1", {1, 2, 3, 4, 5, 6}, {"Enter", "1", "Enter"}}}) {
    SCOPED_TRACE(testing::PrintToString(hand.cards));
    Desk desk("[Settings]\n" + hand.settings);
    desk.Table().Stack(hand.cards);
    for (const std::string& key : hand.keys) Press(desk, key);
  }
  Desk desk;
  desk.Command(kCommandGameSetup);
  Press(desk, "Enter");
}

}  // namespace
}  // namespace feltside::tests
