// The program as a player meets it, by the scripts of tests/scripts.

#include <gtest/gtest.h>

#include "tests/support/script.h"

namespace feltside::tests {
namespace {

class Scripts : public testing::TestWithParam<std::string> {};

TEST_P(Scripts, RunAsWritten) { PlayScript(GetParam()); }

std::string NameOf(const testing::TestParamInfo<std::string>& script) { return script.param; }
INSTANTIATE_TEST_SUITE_P(Of, Scripts, testing::ValuesIn(ScriptNames()), NameOf);

}  // namespace
}  // namespace feltside::tests
