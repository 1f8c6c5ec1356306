#pragma once

#include <cstdio>
#include <string>

namespace feltside {

/// A number in a format of the printf family that takes just this one.
template <class Number>
std::string NumberText(const char* format, Number number) {
  char text[400];  // the longest double has 309 digits before its point
  std::snprintf(text, sizeof text, format, number);
  return text;
}

}  // namespace feltside
