#pragma once

#include <string>
#include <vector>

#include "platform/draw/geometry.h"
#include "platform/host/runtime.h"

namespace feltside {

/// What is wrong with a command of the stylus script.
struct CommandError {
  std::string what;
};

// The words of a command as what they mean; each throws a CommandError where a word does not mean
// that.

int ToInt(const std::string& word);
/// The identifier of a command, which may be given by its name too.
int ToCommand(const std::string& word);
/// A card by its rank and suit or by its number.
int ToCard(const std::string& word);
/// The two words behind a command's name.
platform::Point ToPoint(const std::vector<std::string>& words);
/// A finite number of dollars.
double ToMoney(const std::string& word);
/// "YYYY-MM-DDTHH:MM:SS", a day that the calendar has.
platform::LocalTime ToTime(const std::string& word);

}  // namespace feltside
