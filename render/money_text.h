#pragma once

#include <cstdio>
#include <string>

namespace feltside {

/// An amount as the table shows it, a minus sign behind the dollar sign: "$5", "$-2.50".
inline std::string MoneyText(double dollars, int decimals) {
  char text[400];  // the longest double has 309 digits before its point
  std::snprintf(text, sizeof text, "$%.*f", decimals, dollars);
  return text;
}

}  // namespace feltside
