// The stylus script itself: what it does not understand changes nothing, and how it ends.

#include <gtest/gtest.h>

#include "tests/support/hands.h"
#include "tests/support/script.h"

namespace feltside::tests {
namespace {

TEST(StylusScript, AnswersAnErrorToWhatItDoesNotUnderstand) {
  Stylus stylus;
  Json before = stylus.Send("state");
  for (const char* line : {"deal",
                           "tap",
                           "tap 1",
                           "tap 1 2 3",
                           "tap one two",
                           "tap 1.5 2",
                           "tap 99999999999 2",
                           "touch 1",
                           "command",
                           "command Hit",
                           "command 1 2",
                           "key",
                           "key NoSuchKey",
                           "key Ctrl+",
                           "key \x01",
                           "type",
                           "clock",
                           "clock 2000-13-01T00:00:00",
                           "clock 2001-02-29T00:00:00",
                           "clock 2000-00-01T00:00:00",
                           "clock 2000-01-01T24:00:00",
                           "clock 2000-01-01 12:00:00",
                           "clock 2000-01-01T12:00:00x",
                           "clock 2000-01-01T12:60:00",
                           "stack",
                           "stack 0",
                           "stack 53",
                           "stack -1",
                           "stack ace",
                           "stack 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1",
                           "wallet",
                           "wallet nan",
                           "wallet inf",
                           "wallet 1e999",
                           "wallet ten",
                           "wallet 1 2",
                           "state now",
                           "shot",
                           "shot /nowhere/at/all.png",
                           "close now",
                           "press 1",
                           "select 1 1",
                           "slide 1 1",
                           "   ",
                           "\xFF\xFE is no text"}) {
    const Json answer = stylus.Send(line);
    EXPECT_TRUE(answer.contains("error")) << line << ": " << answer;
    EXPECT_EQ(stylus.Send("state"), before) << line;
  }
  Follow(stylus, {{"# a remark\n\nwallet 7", {{"m_dWallet", 7.0}}},
                  {"tap 240 10", {{"m_dWallet", 7.0}}},
                  {"tap -1 10"},
                  {"command 4711", {{"refused", true}}},
                  {"clock 2004-02-29T23:59:59"},
                  {"command 32776"},
                  {"stack 1", {{"error", "a hand is in progress"}}}});
}

TEST(StylusScript, TellsTheWindow) {
  Stylus stylus;
  Follow(stylus, {{"state", {{"windows", {"Feltside"}}, {"helps", Json::array()}}},
                  {"command 32776", {{"windows", {"Feltside"}}, {"running", true}}}});
}

TEST(StylusScript, EndsWithTheProgram) {
  for (const char* line : {"close", "command 57665"}) {
    Stylus stylus("[Settings]\nUSEHIGH = 0");
    Follow(stylus, {{line, {{"running", false}, {"exit", 0}, {"m_dWallet", 100.0}}}});
  }
}

TEST(StylusScript, TakesPictures) {
  Stylus stylus;
  EXPECT_EQ(stylus.Shot().GetSize(), (platform::Size{240, 294}));
}

}  // namespace
}  // namespace feltside::tests
