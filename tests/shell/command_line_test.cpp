// What is asked for and answered where there is no display.

#include "shell/command_line.h"

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace feltside::tests {
namespace {

using testing::HasSubstr;

TEST(CommandLine, IsAnsweredOrRefused) {
  struct Case {
    std::vector<std::string> words;
    std::optional<int> exitCode;
    std::string out;
    std::string err;
  };
  const std::vector<Case> cases = {{{}, std::nullopt, "", ""},
                                   {{"--version"}, 0, "Feltside 1.0.0.1\n", ""},
                                   {{"--help"}, 0, "--version", ""},
                                   {{"--fast"}, 2, "", "--fast"},
                                   {{"a.txt", "--help"}, 2, "", "a.txt"},
                                   {{"--version", "--fast"}, 2, "", "--fast"},
                                   {{""}, 2, "", "--help"}};
  for (const Case& c : cases) {
    SCOPED_TRACE(testing::PrintToString(c.words));
    std::vector<std::string> words = {"feltside"};
    words.insert(words.end(), c.words.begin(), c.words.end());
    std::vector<char*> argv;
    argv.reserve(words.size());
    for (std::string& word : words) argv.push_back(word.data());
    testing::internal::CaptureStdout();
    testing::internal::CaptureStderr();
    EXPECT_EQ(AnswerCommandLine(static_cast<int>(argv.size()), argv.data()), c.exitCode);
    const std::string out = testing::internal::GetCapturedStdout();
    const std::string err = testing::internal::GetCapturedStderr();
    EXPECT_THAT(out, HasSubstr(c.out));
    EXPECT_EQ(out.empty(), c.out.empty());
    EXPECT_THAT(err, HasSubstr(c.err));
    EXPECT_EQ(err.empty(), c.err.empty());
  }
}

}  // namespace
}  // namespace feltside::tests
