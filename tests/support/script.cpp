#include "tests/support/script.h"

#include <gtest/gtest.h>

namespace feltside::tests {

std::string Missing(const Json& actual, const Json& expected) {
  std::string text;
  for (const auto& [name, value] : expected.items()) {
    if (!actual.contains(name)) {
      text += name + " is missing\n";
    } else if (value.is_object()) {
      text += Missing(actual[name], value);
    } else if (actual[name] != value) {
      text += name + " is " + actual[name].dump() + ", not " + value.dump() + "\n";
    }
  }
  return text;
}

void Follow(Stylus& stylus, const std::vector<Line>& script) {
  for (std::size_t i = 0; i < script.size(); ++i) {
    const Json answer = stylus.Send(script[i].command);
    SCOPED_TRACE("line " + std::to_string(i + 1) + ": " + script[i].command);
    EXPECT_EQ(Missing(answer, script[i].expected), "");
    for (const char* trouble : {"error", "refused"}) {
      EXPECT_EQ(answer.contains(trouble), script[i].expected.contains(trouble));
    }
  }
}

}  // namespace feltside::tests
