// The setup dialogs: what they show, what a confirmation changes, and what it keeps.

#include <gmock/gmock.h>

#include "platform/slider.h"
#include "shell/res/pictures.h"
#include "tests/shell/dialog_desk.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

const std::string kGameSetup = "command 32779";
const std::string kTableSetup = "command 32777";

/// The lines that a confirmation keeps, with one of them another.
std::vector<std::string> Changed(std::vector<std::string> lines, const std::string& changed) {
  const std::string name = changed.substr(0, changed.find(' ') + 1);
  for (std::string& line : lines) {
    if (line.rfind(name, 0) == 0) line = changed;
  }
  return lines;
}

const std::vector<std::string> kGame = {"GAME_TYPE = 0", "NUMDECKS = 1", "PLAYSPEED = 1",
                                        "STRATTYPE = 1"};
const std::vector<std::string> kTable = {"BOXCOLOR = 6599815", "CARDBACK = 54",      "FANCYBJ = 1",
                                         "FANCYVP = 1",        "TABLECOLOR = 39680", "USEHIGH = 1",
                                         "VIDEODISCARDS = 3"};

struct SetupCase {
  std::vector<std::string> commands;
  Json state;  ///< after the last command
  std::vector<std::string> kept = {};
  std::string settings = {};  ///< at the start
};

Json Layout(const char* member, int value) { return {{"m_layout", {{member, value}}}}; }

const std::vector<SetupCase> kSetupCases = {
    // Cancelled, the dialog changes nothing and deals nothing.
    {{kGameSetup, "select 1000 1", "select 1009 2", "press 2"},
     {{"m_nGameType", 0}, {"m_nDeckChoice", 1}, {"m_handPlayer", Json::array()}}},
    {{kGameSetup, "select 1007 2", "key Escape"}, {{"m_nDealerDelay", 1000}}},
    {{kTableSetup, "select 1005 3", "press 1012", "press 2"},
     {{"m_layout", {{"m_nCardBackID", 54}}}, {"m_bUseHighScores", 1}}},
    // Unchanged values are kept too, and a confirmed game setup deals.
    {{"stack 10 9 8 7", kGameSetup, "press 1"},
     {{"m_handPlayer", {10, 9}}, {"m_bHandInProgress", 1}, {"m_dWallet", 100.0}},
     kGame},
    {{"stack 2 4 6 8 10", kGameSetup, "press 1"},
     {{"m_handPoker", {2, 4, 6, 8, 10}}, {"m_dWallet", 99.0}},
     Changed(kGame, "GAME_TYPE = 1"),
     "GAME_TYPE = 1"},
    {{kTableSetup, "press 1"}, {{"m_handPlayer", Json::array()}, {"m_dWallet", 100.0}}, kTable},
    {{kGameSetup, "select 1000 1", "press 1"},
     {{"m_nGameType", 1}, {"m_dWallet", 99.0}},
     Changed(kGame, "GAME_TYPE = 1")},
    // Only the deal shuffles the chosen shoe, after the shuffle of the start.
    {{kGameSetup, "select 1009 2", "press 1"},
     {{"m_shoe6", {{"position", 4}, {"shuffles", 3}}}, {"m_shoe4", {{"shuffles", 2}}}},
     Changed(kGame, "NUMDECKS = 2")},
    {{kGameSetup, "press 1"}, {{"m_nDealerDelay", 1000}}, kGame, "PLAYSPEED = 3"},
    // In a hand there is table setup only.
    {{"stack 10 9 8 7", "command 32776", kGameSetup}, {{"refused", true}}},
    {{"stack 10 9 8 7", "command 32776", kTableSetup, "press 1"},
     {{"m_handPlayer", {10, 9}}},
     kTable},
    {{kTableSetup, kGameSetup}, {{"refused", true}}},
    {{kTableSetup, "press 1"}, {{"m_nMaxDiscards", 3}}, kTable, "VIDEODISCARDS = 4"},
    {{kTableSetup, "press 1013", "press 1"},
     {{"m_nMaxDiscards", 5}},
     Changed(kTable, "VIDEODISCARDS = 5")},
    {{kTableSetup, "press 1013", "press 1"}, {{"m_nMaxDiscards", 3}}, kTable, "VIDEODISCARDS = 5"},
    {{kTableSetup, "press 1012", "press 1"},
     {{"m_bUseHighScores", 0}},
     Changed(kTable, "USEHIGH = 0")},
    {{kTableSetup, "select 1005 3", "press 1"},
     Layout("m_nCardBackID", 57),
     Changed(kTable, "CARDBACK = 57")},
    {{kTableSetup, "press 1500", "slide 6001 255", "press 1", "press 1"},
     Layout("m_crTable", 65280),
     Changed(kTable, "TABLECOLOR = 65280"),
     "TABLECOLOR = 0"},
    {{kTableSetup, "press 1502", "slide 6000 1", "slide 6001 2", "slide 6002 3", "press 1",
      "press 1"},
     Layout("m_crBox", 0x030201),
     Changed(kTable, "BOXCOLOR = 197121")},
    {{kTableSetup, "press 1500", "slide 6000 200", "press 2", "press 1"},
     Layout("m_crTable", 39680),
     kTable},
    {{kTableSetup, "press 1500", "slide 6000 200", "press 1", "press 2"},
     Layout("m_crTable", 39680)},
    // The poker picture goes when it is switched off.
    {{"command 32776", kTableSetup, "press 1010"}, {{"m_pPokerBitmap", 1}}, {}, "GAME_TYPE = 1"},
    {{"command 32776", kTableSetup, "press 1010", "press 1"},
     {{"m_bFancyPoker", 0}, {"m_pPokerBitmap", 0}},
     {"BOXCOLOR = 6599815", "CARDBACK = 54", "FANCYBJ = 1", "FANCYVP = 0", "GAME_TYPE = 1",
      "TABLECOLOR = 39680", "USEHIGH = 1", "VIDEODISCARDS = 3"},
     "GAME_TYPE = 1"},
};

TEST(Setup, KeepsWhatIsConfirmed) {
  for (const SetupCase& test : kSetupCases) {
    SCOPED_TRACE(testing::PrintToString(test.commands));
    Stylus stylus("[Settings]\n" + test.settings + "\n");
    Json answer;
    for (const std::string& command : test.commands) answer = stylus.Send(command);
    EXPECT_EQ(Missing(answer, test.state), "");
    if (test.kept.empty()) {
      EXPECT_EQ(ReadFile(stylus.ProfileFile()), "[Settings]\n" + test.settings + "\n");
    } else {
      EXPECT_EQ(SettingsIn(ReadFile(stylus.ProfileFile())), test.kept);
    }
  }
}

TEST(Setup, WritesItsValuesInTheirOrder) {
  DialogDesk desk;
  WriteWatch writes;
  for (int round = 0; round < 2; ++round) {  // unchanged values are written again
    desk.Command(32777);
    EXPECT_THAT(writes.Take(), IsEmpty());
    desk.Keys("Tab Tab Enter");  // a focused button would take Enter for itself
    EXPECT_THAT(writes.Take(),
                ElementsAre("TABLECOLOR = 39680", "BOXCOLOR = 6599815", "CARDBACK = 54",
                            "VIDEODISCARDS = 3", "FANCYVP = 1", "FANCYBJ = 1", "USEHIGH = 1"));
  }
  for (const int commandID : {32777, 32779}) {
    desk.Command(commandID);
    desk.Keys("Escape");
  }
  EXPECT_THAT(writes.Take(), IsEmpty());
  desk.Command(32779);
  desk.Keys("Enter");
  EXPECT_THAT(writes.Take(),
              ElementsAre("STRATTYPE = 1", "GAME_TYPE = 0", "NUMDECKS = 1", "PLAYSPEED = 1"));
}

TEST(Setup, ShowsAnUnknownSpeedAsNormalAndFourDiscardsAsCleared) {
  Stylus stylus("[Settings]\nPLAYSPEED = 3\nVIDEODISCARDS = 4\n");
  const Json speed = ControlOf(stylus.Send(kGameSetup), 1007);
  EXPECT_EQ(speed["value"], 1);
  EXPECT_EQ(speed["text"], "Normal");
  stylus.Send("press 2");
  EXPECT_EQ(ControlOf(stylus.Send(kTableSetup), 1013)["value"], 0);
}

TEST(Setup, ShowsTheChosenCardBackAtOnce) {
  platform::CResources pictures(PictureFiles());
  DialogDesk desk;
  desk.Command(32777);
  const platform::Rect dialog = desk.Dialog()->GetPlace();
  const platform::Point at{dialog.left + 1 + 30, dialog.top + 20 + 70};
  for (int back = 54; back <= 65; ++back) {
    if (back > 54) desk.Wheel(desk.Middle(1005), -1);
    const platform::CBitmap& picture = pictures.LoadBitmap(back, {29, 41});
    for (int y = 0; y < 41; ++y) {
      for (int x = 0; x < 29; ++x) {
        const platform::Point p{x, y};
        ASSERT_EQ(desk.Shown().At(at + p), picture.At(p)) << back << ": " << x << ", " << y;
      }
    }
  }
}

TEST(Setup, ShowsTheEditedColorInSampleNumberAndSwatch) {
  DialogDesk desk("[Settings]\nTABLECOLOR = 0\n");
  desk.Command(32777);
  desk.Tap(desk.Middle(1500));
  const platform::Point sample = desk.Middle(1012);
  const auto color = [&desk](platform::Point at) { return platform::ToColor(desk.Shown().At(at)); };
  EXPECT_EQ(color(sample), platform::kBlack);
  // The sample follows while the thumb is dragged.
  const auto& green = desk.Dialog()->Item<platform::CSlider>(6001);
  const platform::Point top = green.ScreenOrigin();
  desk.Press(top + green.ThumbMiddle(0));
  desk.Move(top + green.ThumbMiddle(128));
  EXPECT_EQ(color(sample), platform::Rgb(0, green.GetValue(), 0));
  EXPECT_NEAR(green.GetValue(), 128, 2);
  desk.Move(top + green.ThumbMiddle(255));
  desk.Release(top + green.ThumbMiddle(255));
  EXPECT_EQ(color(sample), 65280U);
  EXPECT_EQ(desk.Control(6003).GetText(), "0");
  EXPECT_EQ(desk.Control(6004).GetText(), "255");
  EXPECT_EQ(desk.Control(6005).GetText(), "0");
  desk.Keys("Enter");
  EXPECT_EQ(color(desk.Middle(1501)), 65280U);
}

TEST(Setup, HoldsForTheRunWhenItCannotBeKept) {
  Stylus stylus;
  stylus.Send("state");
  std::filesystem::create_directories(stylus.ProfileFile());  // where the file should be
  const Json chosen = {{"m_nStrategyMode", 2}, {"m_nDealerDelay", 2000}, {"m_bFancyBlackjack", 0}};
  Follow(stylus, {{kGameSetup},
                  {"select 1008 2"},
                  {"select 1007 0"},
                  {"press 1"},
                  {kTableSetup},
                  {"press 1014"},
                  {"press 1", chosen},
                  {"command 32772", chosen}});
  EXPECT_THAT(stylus.Errors(), HasSubstr("STRATTYPE"));
  EXPECT_THAT(stylus.Errors(), HasSubstr("FANCYBJ"));
}

/// Every setting other than at first.
const Json kEveryChange = {
    {"m_nGameType", 1},
    {"m_nDealerDelay", 200},
    {"m_nStrategyMode", 2},
    {"m_nDeckChoice", 2},
    {"m_nMaxDiscards", 5},
    {"m_bFancyPoker", 0},
    {"m_bFancyBlackjack", 0},
    {"m_bUseHighScores", 0},
    {"m_layout", {{"m_crTable", 0xFF3200}, {"m_crBox", 0x0000FF}, {"m_nCardBackID", 61}}}};

void ExpectBackAfterRestart(const std::vector<std::string>& commands) {
  std::string profile;
  {
    Stylus stylus;
    EXPECT_NE(Missing(stylus.Send("state"), kEveryChange), "");
    for (const std::string& command : commands) {
      const Json answer = stylus.Send(command);
      EXPECT_FALSE(answer.contains("error") || answer.contains("refused")) << command;
    }
    EXPECT_EQ(Missing(stylus.Send("close"), kEveryChange), "");
    profile = ReadFile(stylus.ProfileFile());
  }
  Stylus again(profile);
  EXPECT_EQ(Missing(again.Send("state"), kEveryChange), "");
}

TEST(Setup, EverySettingChosenByStylusIsBackAfterARestart) {
  ExpectBackAfterRestart({kGameSetup,      "select 1000 1",  "select 1007 2",  "select 1008 2",
                          "select 1009 2", "press 1",        kTableSetup,      "press 1500",
                          "slide 6000 0",  "slide 6001 50",  "slide 6002 255", "press 1",
                          "press 1502",    "slide 6000 255", "slide 6001 0",   "slide 6002 0",
                          "press 1",       "select 1005 7",  "press 1010",     "press 1012",
                          "press 1013",    "press 1014",     "press 1"});
}

TEST(Setup, EverySettingChosenByKeyboardIsBackAfterARestart) {
  std::vector<std::string> commands;
  for (const char* key :
       {"Alt+B", "G", "Down", "Tab", "F", "Tab", "End", "Tab", "S", "Enter",
        // Table colour, player box, card back, then the boxes.
        "F10", "T", "Space", "Home", "Tab", "Home", "PageDown", "Tab", "End", "Enter", "Tab",
        "Space", "End", "Tab", "Home", "Tab", "Home", "Enter", "Tab", "F4", "S", "S", "Enter",
        "Tab", "Space", "Tab", "Space", "Tab", "Space", "Tab", "Space", "Enter"}) {
    commands.push_back(std::string("key ") + key);
  }
  ExpectBackAfterRestart(commands);
}

}  // namespace
}  // namespace feltside::tests
