// The five best results, and the ways to leave the table.

#include <gmock/gmock.h>

#include <limits>

#include "shell/feltside_app.h"
#include "tests/shell/dialog_desk.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

using testing::ElementsAre;

using Entries = std::vector<std::string>;

const std::string kExit = "command 57665";
const Json kLeft = {{"running", false}, {"exit", 0}};
const Json kEntryOpen = {{"windows", {"Feltside", "High Scores"}}, {"running", true}};
const Json kQuestion = {{"windows", {"Feltside", "High Scores", "Feltside"}}};

std::string ProfileWith(const Entries& entries, const std::string& more = {}) {
  std::string text = "[Settings]\n" + more;
  for (std::size_t i = 0; i < entries.size(); ++i) {
    text += "High" + std::to_string(i) + " = " + Json(entries[i]).dump() + "\n";
  }
  return text;
}

/// High0 to High4 as a profile holds them, empty where there is none.
Entries KeptIn(const Stylus& stylus) {
  const platform::CProfile profile(stylus.ProfileFile());
  Entries entries;
  for (int i = 0; i < 5; ++i) {
    entries.push_back(profile.GetString("Settings", "High" + std::to_string(i), ""));
  }
  return entries;
}

/// What stands on the dialog's five lines.
Entries Shown(const Json& state) {
  Entries lines;
  for (int line = 6009; line <= 6013; ++line) lines.push_back(ControlOf(state, line)["text"]);
  return lines;
}

bool IsEntryShown(const Json& state) {
  int visible = 0;
  for (const int number : {6016, 6014, 6015, 1011}) {
    visible += ControlOf(state, number)["visible"] ? 1 : 0;
  }
  EXPECT_TRUE(visible == 0 || visible == 4) << visible;
  return visible == 4;
}

TEST(HighScores, AScoreIsTheNumberAfterTheLastBlank) {
  constexpr int kMost = std::numeric_limits<int>::max();
  constexpr int kLeast = std::numeric_limits<int>::min();
  const std::vector<std::pair<std::string, int>> cases = {
      // clang-format off
      {"Ann 500", 500}, {"Ann Lee 250", 250}, {"Ann", 0}, {"", 0}, {"12", 12}, {"Ann 12 ", 0},
      {"A -5", -5}, {"A +7", 7}, {"A 7x8", 7}, {"A \t7", 7}, {"A x7", 0}, {"A - 3", 3},
      {"A 2147483647", kMost}, {"A 2147483648", kMost}, {"A 99999999999999999999", kMost},
      {"A -2147483648", kLeast}, {"A -2147483649", kLeast}, {"A -99999999999999999999", kLeast},
      // clang-format on
  };
  for (const auto& [entry, score] : cases) EXPECT_EQ(CFeltsideApp::ScoreOf(entry), score) << entry;
}

const Entries kFull = {"A 900", "B 800", "C 700", "D 600", "E 200"};

struct LeaveCase {
  const char* wallet;
  bool offered;
  Entries entries = {};
  std::string settings = {};
};

TEST(Leaving, OffersAnEntryOnlyWhenItIsEarned) {
  const std::vector<LeaveCase> cases = {{"100", false},
                                        {"100.5", true},
                                        {"-20", false},
                                        {"5000", false, {}, "USEHIGH = 0\n"},
                                        {"101", true, {"A 900", "B 800", "C 700", "D 600"}},
                                        {"200", false, kFull},
                                        {"200.9", false, kFull},
                                        {"201", true, kFull},
                                        {"101", true, {"A 9", "B 9", "C 9", "D 9", "E x"}},
                                        {"1e300", false, {"A", "B", "C", "D", "E 99999999999"}}};
  for (const LeaveCase& test : cases) {
    SCOPED_TRACE(test.wallet);
    Stylus stylus(ProfileWith(test.entries, test.settings));
    stylus.Send(std::string("wallet ") + test.wallet);
    const Json answer = stylus.Send(kExit);
    EXPECT_EQ(Missing(answer, test.offered ? kEntryOpen : kLeft), "");
    if (!test.offered) continue;
    EXPECT_TRUE(IsEntryShown(answer));
    EXPECT_EQ(Missing(stylus.Send("key Escape"), kLeft), "");  // leaves all the same
  }
}

struct AddCase {
  Entries before;
  const char* wallet;
  std::string name;
  Entries after;
};

TEST(HighScores, AnEntryTakesItsPlace) {
  const std::vector<AddCase> cases = {
      {{}, "250", "Ann Lee", {"Ann Lee 250", "", "", "", ""}},
      {{"Bob 300"}, "300.9", "Carl", {"Bob 300", "Carl 300", "", "", ""}},
      {kFull, "201", "F", {"A 900", "B 800", "C 700", "D 600", "F 201"}},
      {kFull, "1000", "F", {"F 1000", "A 900", "B 800", "C 700", "D 600"}},
      {kFull, "700", "F", {"A 900", "B 800", "C 700", "F 700", "D 600"}},
      {{"Low 5", "High 900"}, "500", "F", {"F 500", "Low 5", "High 900", "", ""}},
      {{}, "1e300", "Rich", {"Rich 2147483647", "", "", "", ""}},
      {{}, "101", "x ", {"x  101", "", "", "", ""}}};
  for (const AddCase& test : cases) {
    Stylus stylus(ProfileWith(test.before));
    Follow(stylus,
           {{std::string("wallet ") + test.wallet}, {kExit, kEntryOpen}, {"type " + test.name}});
    const Json added = stylus.Send("press 1");  // enters the name and leaves the list open
    EXPECT_EQ(Missing(added, kEntryOpen), "");
    EXPECT_FALSE(IsEntryShown(added));
    EXPECT_EQ(Shown(added), test.after);
    EXPECT_EQ(Missing(stylus.Send("press 1"), kLeft), "");
    EXPECT_EQ(KeptIn(stylus), test.after);
  }
}

TEST(HighScores, NamesComeBackLetterForLetter) {
  for (const std::string name :
       {" both ends ", "\"quoted\" 'twice'", "C:\\n\\t\\\\", "a = b # c", "[Settings]", "{x} [[y]]",
        "\U0001F600\U0001F3B2 \U0001F469\u200D\U0001F680", "\u05E9\u05DC\u05D5\u05DD \u0633\u0644",
        "e\u0301 \u00E9 \uFB01 \u4E2D\u6587", "'''", "\"\"\"", "x 999", "\u00A0\u2003nb\u00A0",
        "a very long name that no line of the list could ever hold whole"}) {
    std::string profile;
    {
      Stylus stylus;
      Follow(stylus, {{"wallet 321"},
                      {kExit, kEntryOpen},
                      {"type " + name},
                      {"press 1011"},
                      {"key Escape", kLeft}});
      EXPECT_EQ(KeptIn(stylus)[0], name + " 321");
      profile = ReadFile(stylus.ProfileFile());
    }
    Stylus again(profile);
    EXPECT_EQ(Shown(again.Send("command 32781"))[0], name + " 321");
    Follow(again, {{"key Enter"}, {"close", kLeft}});
    EXPECT_EQ(ReadFile(again.ProfileFile()), profile);
  }
}

TEST(HighScores, TheListIsShownWhileItHoldsAnEntry) {
  Stylus empty;
  Follow(empty,
         {{"command 32781", {{"refused", true}}}, {"state", {{"enabled", {{"32781", false}}}}}});
  Stylus stylus(ProfileWith({"A 900", "B 800"}));
  Follow(stylus, {{"state", {{"enabled", {{"32781", true}}}}}});
  const Json shown = stylus.Send("command 32781");
  EXPECT_THAT(Shown(shown), ElementsAre("A 900", "B 800", "", "", ""));
  EXPECT_FALSE(IsEntryShown(shown));
  Follow(stylus, {{"type x"}, {"press 1", {{"windows", {"Feltside"}}, {"running", true}}}});
}

TEST(HighScores, GapsAreClosedWhenTheListIsLoaded) {
  std::string profile = "[Settings]\nHigh0 = 'Ann 500'\nHigh2 = 'Bob 300'\nHigh3 = ''\nHigh4 = 7\n";
  for (const Entries& shown : {Entries{"Ann 500", "Bob 300", "", "", ""},
                               Entries{"Ann 500", "Bob 300", "Bob 300", "", ""}}) {
    Stylus stylus(profile);
    EXPECT_EQ(Shown(stylus.Send("command 32781")), shown);
    Follow(stylus, {{"press 1"}, {"close", kLeft}});
    EXPECT_THAT(KeptIn(stylus), ElementsAre("Ann 500", "Bob 300", "Bob 300", "", ""));
    profile = ReadFile(stylus.ProfileFile());
  }
}

TEST(HighScores, WhatAnotherGameKeptMeanwhileStays) {
  Stylus stylus(ProfileWith({"Old 150"}));
  stylus.Send("wallet 300");
  stylus.SetSettings("High0 = 'Ann 900'\nHigh1 = 'Old 150'");
  Follow(stylus, {{kExit, kEntryOpen}, {"type Bob"}, {"press 1"}, {"press 1", kLeft}});
  EXPECT_THAT(KeptIn(stylus), ElementsAre("Ann 900", "Bob 300", "Old 150", "", ""));
}

TEST(HighScores, AnEmptyNameIsAskedAbout) {
  Stylus stylus;
  Follow(stylus, {{"wallet 150"},
                  {kExit, kEntryOpen},
                  {"press 1011", kEntryOpen},  // nothing to add: the keyboard goes to the name
                  {"press 1", kQuestion},
                  {kExit, {{"refused", true}}},
                  {"press 7", kEntryOpen},
                  {"type Ann"},
                  {"key Ctrl+A"},
                  {"key Delete"},
                  {"key Enter", kQuestion},
                  {"key Y", kLeft}});
  EXPECT_THAT(KeptIn(stylus), ElementsAre("", "", "", "", ""));
  DialogDesk desk;
  desk.Wallet(150);
  desk.Command(57665);
  desk.Tap(desk.Middle(1011));
  EXPECT_EQ(desk.Focus(), 6016);
}

TEST(HighScores, ASecondExitIsRefused) {
  Stylus stylus;
  Follow(stylus, {{"wallet 150"},
                  {kExit, kEntryOpen},
                  {kExit, {{"refused", true}}},
                  {"type Ann"},
                  {"key Enter", kEntryOpen},
                  {kExit, {{"refused", true}}},
                  {"key Enter", kLeft}});
  EXPECT_EQ(KeptIn(stylus)[0], "Ann 150");
}

TEST(Closing, SavesTheListAndOffersNothing) {
  for (const std::string close : {"close", "touch 228 12"}) {
    Stylus stylus(ProfileWith({"", "Ann 500"}));
    Follow(stylus, {{"wallet 5000"}, {close, kLeft}});
    EXPECT_THAT(KeptIn(stylus), ElementsAre("Ann 500", "Ann 500", "", "", ""));
  }
  // In the midst of a dialog, too; what was entered by then counts.
  Stylus stylus;
  Follow(stylus, {{"wallet 5000"}, {kExit}, {"type Ann"}, {"close", kLeft}});
  EXPECT_EQ(KeptIn(stylus)[0], "");
  Stylus asked;
  Follow(asked, {{"wallet 5000"}, {kExit}, {"press 1", kQuestion}, {"close", kLeft}});
  EXPECT_EQ(KeptIn(asked)[0], "");
  Stylus added;
  Follow(added, {{"wallet 5000"}, {kExit}, {"type Ann"}, {"press 1011"}, {"close", kLeft}});
  EXPECT_EQ(KeptIn(added)[0], "Ann 5000");
}

TEST(Closing, TheTitleStays) {
  Stylus stylus;
  Follow(stylus, {{"state", {{"windows", {"Feltside"}}}},
                  {"command 57664", {{"windows", {"Feltside", "About Feltside"}}}},
                  {"key Enter", {{"windows", {"Feltside"}}}},
                  {"command 32778",
                   {{"helps", {"file:feltside.htm#Main_Contents"}}, {"windows", {"Feltside"}}}}});
}

}  // namespace
}  // namespace feltside::tests
