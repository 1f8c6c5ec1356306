#pragma once

#include <string>

#include "tests/support/stylus.h"

namespace feltside::tests {

/// The blackjack table in a line of six fields: the wallet; the player's total and message; the
/// same of the split hand; the dealer's total; the flags that are set (insured, doubled, second for
/// playing the split hand, "doubled second" for that one doubled); and what may be done now.
std::string TableLine(const Json& state);

}  // namespace feltside::tests
