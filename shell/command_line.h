#pragma once

#include <optional>

namespace feltside {

/// What stands behind the program's name, as main has it: nothing, and the game is to be played.
/// Else an option that is answered on the standard output, or anything else, which is refused on
/// the error stream; returns the code to end with then.
std::optional<int> AnswerCommandLine(int argc, char** argv);

}  // namespace feltside
