// The settings as they reach the table, and the document renewed.

#include <gtest/gtest.h>

#include "tests/support/hands.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

const Json kDefaults = {
    {"m_nGameType", 0},
    {"m_bUseHighScores", 1},
    {"m_bFancyPoker", 1},
    {"m_bFancyBlackjack", 1},
    {"m_layout", {{"m_nCardBackID", 54}, {"m_crTable", 39680}, {"m_crBox", 6599815}}},
    {"m_nMaxDiscards", 3},
    {"m_nStrategyMode", 1},
    {"m_nDeckChoice", 1},
    {"m_nDealerDelay", 1000}};

TEST(Settings, AreReadAtTheStart) {
  struct Case {
    const char* file;
    Json change;  // from the defaults
  };
  const char* const nothing = "";
  for (const Case& c :
       std::vector<Case>{{nothing, Json::object()},
                         {"GAME_TYPE = 1", {{"m_nGameType", 1}}},
                         {"GAME_TYPE = 2", Json::object()},
                         {"GAME_TYPE = -1", Json::object()},
                         {"GAME_TYPE = '1'", Json::object()},
                         {"GAME_TYPE = 1.0", Json::object()},
                         {"GAME_TYPE = 4294967297", Json::object()},
                         {"USEHIGH = 0", {{"m_bUseHighScores", 0}}},
                         {"USEHIGH = 2", Json::object()},
                         {"FANCYVP = 0", {{"m_bFancyPoker", 0}}},
                         {"FANCYBJ = 0", {{"m_bFancyBlackjack", 0}}},
                         {"FANCYBJ = true", Json::object()},
                         {"CARDBACK = 65", {{"m_layout", {{"m_nCardBackID", 65}}}}},
                         {"CARDBACK = 53", Json::object()},
                         {"CARDBACK = 66", Json::object()},
                         {"TABLECOLOR = 0", {{"m_layout", {{"m_crTable", 0}}}}},
                         {"TABLECOLOR = 0xFFFFFF", {{"m_layout", {{"m_crTable", 0xFFFFFF}}}}},
                         {"TABLECOLOR = 0x1000000", Json::object()},
                         {"BOXCOLOR = 255", {{"m_layout", {{"m_crBox", 255}}}}},
                         {"BOXCOLOR = -1", Json::object()},
                         {"VIDEODISCARDS = 5", {{"m_nMaxDiscards", 5}}},
                         {"VIDEODISCARDS = 4", {{"m_nMaxDiscards", 4}}},
                         {"VIDEODISCARDS = 6", Json::object()},
                         {"STRATTYPE = 0", {{"m_nStrategyMode", 0}}},
                         {"STRATTYPE = 2", {{"m_nStrategyMode", 2}}},
                         {"STRATTYPE = 3", Json::object()},
                         {"NUMDECKS = 2", {{"m_nDeckChoice", 2}}},
                         {"NUMDECKS = 3", Json::object()},
                         {"PLAYSPEED = 0", {{"m_nDealerDelay", 2000}}},
                         {"PLAYSPEED = 2", {{"m_nDealerDelay", 200}}},
                         {"PLAYSPEED = 3", Json::object()}}) {
    const bool empty = c.file == nothing;
    Stylus stylus(empty ? "" : std::string("[Settings]\n") + c.file);
    Json expected = kDefaults;
    expected.merge_patch(c.change);
    EXPECT_EQ(Missing(stylus.Send("state"), expected), "") << c.file;
  }
}

TEST(Settings, AreReadAnewWithTheDocument) {
  for (const char* key : {"key Ctrl+N", "key Ctrl+O"}) {
    Stylus stylus;
    Follow(stylus, {{"command 32776"}, {"key N"}, {"command 32772"}, {"wallet 42.5"}});
    const Json before = stylus.Send("state");
    stylus.SetSettings("GAME_TYPE = 1\nCARDBACK = 60");
    const Json after = stylus.Send(key);
    EXPECT_EQ(Missing(after, {{"m_nGameType", 1},
                              {"m_layout", {{"m_nCardBackID", 60}}},
                              {"m_dWallet", 42.5},
                              {"m_bShowTitle", 0},
                              {"m_handPlayer", before["m_handPlayer"]},
                              {"m_shoe4", {{"position", 0}, {"shuffles", 4}}},
                              {"m_deck1", {{"position", 0}, {"shuffles", 3}}}}),
              "")
        << key;
  }
}

TEST(Settings, LeaveAHandThatIsBeingPlayedInItsGame) {
  Stylus stylus;
  Follow(stylus, {{StackOf("T 8 T 9")}, {"command 32776"}});
  stylus.SetSettings("GAME_TYPE = 1");
  Follow(stylus, {{"key Ctrl+N", {{"m_nGameType", 0}, {"m_bHandInProgress", 1}}},
                  {"command 32772", {{"m_dWallet", 95.0}, {"m_strPlayerMsg", "Dealer Wins!"}}},
                  {"key Ctrl+N", {{"m_nGameType", 1}}},
                  {"key Enter", {{"m_dWallet", 94.0}, {"m_bDrawPending", 1}}}});
  stylus.SetSettings("GAME_TYPE = 0");
  Follow(stylus, {{"key Ctrl+O", {{"m_nGameType", 1}, {"m_bDrawPending", 1}}},
                  {"key Enter", {{"m_bDrawPending", 0}}},
                  {"key Ctrl+O", {{"m_nGameType", 0}}}});
}

TEST(Settings, ADamagedFileIsKeptAndSaid) {
  Stylus stylus("[Settings\nGAME_TYPE = 1");
  EXPECT_EQ(Missing(stylus.Send("state"), kDefaults), "");
  EXPECT_EQ(ReadFile(stylus.ProfileFile().string() + ".damaged-1"), "[Settings\nGAME_TYPE = 1");
  EXPECT_NE(stylus.Errors().find("cannot be understood"), std::string::npos);
}

}  // namespace
}  // namespace feltside::tests
