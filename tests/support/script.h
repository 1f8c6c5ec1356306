#pragma once

#include <string>
#include <vector>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// A command and what its answer must hold: these members with these values; members of an object
/// inside likewise.
struct Line {
  std::string command;
  Json expected = Json::object();
};

/// Gives the commands one after another and fails the test at every answer that is not as expected;
/// an error or a refusal must be expected too.
void Follow(Stylus& stylus, const std::vector<Line>& script);

/// What an object lacks or holds otherwise than expected, one difference a line; empty: nothing.
std::string Missing(const Json& actual, const Json& expected);

}  // namespace feltside::tests
