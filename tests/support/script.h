#pragma once

#include <string>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// How a player gets at the table; the words of a script stand for its buttons or its keys.
enum class Door { kButtons, kKeys };

/// Plays a file of tests/scripts through feltside-stylus and fails the test at every line that is
/// not as expected. Its README says how such a file is written.
void PlayScript(const std::string& name, Door door = Door::kButtons);

/// The "stack" command for cards such as "AS KH T 2D": a rank (A, 2 .. 9, T, J, Q, K) and a suit
/// (C, D, H, S) each. Cards without a suit are clubs.
std::string StackOf(const std::string& cards);

/// Gives a command and returns the answer, which must be neither an error nor a refusal.
Json Do(Stylus& stylus, const std::string& command);

/// What an object lacks or holds otherwise than expected, one difference a line; empty: nothing.
std::string Missing(const Json& actual, const Json& expected);

}  // namespace feltside::tests
