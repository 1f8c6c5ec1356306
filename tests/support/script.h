#pragma once

#include <string>
#include <vector>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// Plays a file of tests/scripts through feltside-stylus and fails the test at every line that is
/// not as expected. Its README says how such a file is written.
void PlayScript(const std::string& name);

/// The parts of a text between separators; at least one.
std::vector<std::string> SplitAt(const std::string& separator, std::string text);

/// Gives a command and returns the answer, which must be neither an error nor a refusal.
Json Do(Stylus& stylus, const std::string& command);

/// What an object lacks or holds otherwise than expected, one difference a line; empty: nothing.
std::string Missing(const Json& actual, const Json& expected);

}  // namespace feltside::tests
