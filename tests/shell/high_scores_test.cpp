// The five best results: what an entry is worth, and that names come back as they were typed.

#include <gtest/gtest.h>

#include <limits>

#include "shell/feltside_app.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

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

TEST(HighScores, NamesComeBackLetterForLetter) {
  for (const std::string name :
       {" both ends ", "\"quoted\" 'twice'", "C:\\n\\t\\\\", "a = b # c", "[Settings]", "{x} [[y]]",
        "\U0001F600\U0001F3B2 \U0001F469\u200D\U0001F680", "\u05E9\u05DC\u05D5\u05DD \u0633\u0644",
        "e\u0301 \u00E9 \uFB01 \u4E2D\u6587", "'''", "\"\"\"", "x 999", "\u00A0\u2003nb\u00A0", " ",
        "a very long name that no line of the list could ever hold whole"}) {
    Stylus stylus;
    for (const char* command : {"wallet 321", "command exit"}) Do(stylus, command);
    Do(stylus, "type " + name);
    for (const char* command : {"press 1011", "key Escape"}) Do(stylus, command);
    Stylus again(ReadFile(stylus.ProfileFile()));
    EXPECT_EQ(Do(again, "command scores")["controls"][2]["text"], name + " 321");
    Do(again, "key Enter");
    Do(again, "close");
    EXPECT_EQ(ReadFile(again.ProfileFile()), ReadFile(stylus.ProfileFile()));
  }
}

}  // namespace
}  // namespace feltside::tests
