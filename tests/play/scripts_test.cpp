// The program as a player meets it, by the scripts of tests/scripts.

#include <gtest/gtest.h>

#include "tests/support/script.h"

namespace feltside::tests {
namespace {

class Scripts : public testing::TestWithParam<const char*> {};

TEST_P(Scripts, RunAsWritten) { PlayScript(GetParam()); }

INSTANTIATE_TEST_SUITE_P(Of, Scripts,
                         testing::Values("blackjack_hands", "blackjack_table", "dialog_keys",
                                         "dialog_stylus", "high_scores", "menu", "settings",
                                         "setup", "stylus", "tips", "video_poker"));

}  // namespace
}  // namespace feltside::tests
