// Whole frames as the player sees them, compared with stored pictures.

#include <gtest/gtest.h>

#include "platform/surface.h"
#include "tests/support/golden.h"
#include "tests/support/hands.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using platform::CBitmap;

struct FrameCase {
  const char* name;
  const char* settings;
  std::vector<std::string> commands;
};

const std::string kDeal = "command 32776";
const std::string kPoker = StackOf("7S 7D QS QH AS 2C");

const std::vector<FrameCase> kFrames = {
    {"blackjack_title", "", {}},
    {"blackjack_dealt", "", {StackOf("TH 6D KS 7C"), kDeal}},
    {"blackjack_insurance", "", {StackOf("TH 6D KS AC"), kDeal, "tap 180 118"}},
    {"blackjack_split",
     "CARDBACK = 61",
     {StackOf("8H 8S TC 7C 3D 9D 2S"), kDeal, "command 32773", "command 32772", "command 32771"}},
    {"blackjack_settled", "", {"tap 110 160", StackOf("6H 5S TC 7D 9H"), kDeal, "command 32775"}},
    {"blackjack_natural", "FANCYBJ = 0", {StackOf("AH KS TC 7D"), kDeal}},
    {"blackjack_five_cards",
     "STRATTYPE = 0",
     {StackOf("2H 3S TC 7D 2D 4C 5C"), kDeal, "command 32771", "command 32771", "command 32771"}},
    {"blackjack_negative_wallet", "", {"wallet -5.5", StackOf("TH 8D KS 9C"), kDeal, "key S"}},
    {"blackjack_advice", "STRATTYPE = 2", {StackOf("6H 5S TC 7D 9H"), kDeal}},
    {"poker_dealt", "GAME_TYPE = 1", {kPoker, kDeal}},
    {"poker_marked", "GAME_TYPE = 1", {kPoker, kDeal, "key 1", "key 4", "key 5"}},
    {"poker_won", "GAME_TYPE = 1", {kPoker, kDeal, "key 1", "key Enter"}},
    {"poker_negative_wallet", "GAME_TYPE = 1", {"wallet -12.5", kPoker, kDeal, "key Enter"}},
    {"plain_poker_dealt", "GAME_TYPE = 1\nFANCYVP = 0", {kPoker, kDeal}},
    {"plain_poker_marked",
     "GAME_TYPE = 1\nFANCYVP = 0\nFANCYBJ = 0\nVIDEODISCARDS = 5",
     {kPoker, kDeal, "key 1", "key 2", "key 3", "key 4", "key 5"}},
    {"plain_poker_won", "GAME_TYPE = 1\nFANCYVP = 0", {kPoker, kDeal, "key 1", "key Enter"}},
    {"plain_poker_negative_wallet",
     "GAME_TYPE = 1\nFANCYVP = 0\nFANCYBJ = 0",
     {"wallet -2.5", kPoker, kDeal, "key Enter"}},
};

CBitmap TableOf(Stylus& stylus) {
  CBitmap table({240, 268});
  platform::CSurface(table).BitBlt({}, {240, 268}, stylus.Shot(), {0, 26});
  return table;
}

TEST(Frames, LookAsTheyDid) {
  for (const FrameCase& frame : kFrames) {
    Stylus stylus(std::string("[Settings]\n") + frame.settings);
    for (const std::string& command : frame.commands) {
      EXPECT_FALSE(stylus.Send(command).contains("error")) << frame.name << ": " << command;
    }
    ExpectGolden(TableOf(stylus), frame.name);
  }
}

TEST(Frames, ShowTheTitleWhateverTheGame) {
  Stylus blackjack;
  Stylus poker("[Settings]\nGAME_TYPE = 1\nFANCYVP = 0");
  EXPECT_EQ(TableOf(blackjack), TableOf(poker));
}

TEST(Frames, HaveTheTableColorWhereNoPictureIs) {
  for (const char* game : {"0", "1"}) {
    Stylus stylus(
        std::string("[Settings]\nFANCYBJ = 0\nFANCYVP = 0\nTABLECOLOR = 255\nGAME_TYPE = ") + game);
    stylus.Send(kDeal);
    const CBitmap table = TableOf(stylus);
    for (const platform::Point p : {platform::Point{0, 267}, {239, 267}, {230, 120}, {0, 180}}) {
      EXPECT_EQ(platform::ToColor(table.At(p)), platform::Rgb(255, 0, 0));
    }
  }
}

}  // namespace
}  // namespace feltside::tests
