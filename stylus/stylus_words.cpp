#include "stylus/stylus_words.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <system_error>

#include "engine/card.h"
#include "engine/card_text.h"
#include "stylus/command_names.h"

namespace feltside {
namespace {

std::optional<int> WholeNumber(const std::string& word) {
  int value = 0;
  const auto [end, error] = std::from_chars(word.data(), word.data() + word.size(), value);
  if (error != std::errc{} || end != word.data() + word.size()) return std::nullopt;
  return value;
}

/// Digits and signs just where the time is written with them.
bool HasTimeShape(const std::string& text) {
  const std::string shape = "0000-00-00T00:00:00";
  const auto alike = [](char shown, char given) {
    return shown == '0' ? given >= '0' && given <= '9' : shown == given;
  };
  return std::equal(shape.begin(), shape.end(), text.begin(), text.end(), alike);
}

bool IsTime(const platform::LocalTime& t) {
  const std::chrono::year_month_day day{std::chrono::year(t.year),
                                        std::chrono::month(static_cast<unsigned>(t.month)),
                                        std::chrono::day(static_cast<unsigned>(t.day))};
  return t.year >= 1 && day.ok() && t.hour <= 23 && t.minute <= 59 && t.second <= 59;
}

}  // namespace

int ToInt(const std::string& word) {
  const auto number = WholeNumber(word);
  if (!number) throw CommandError{"not a whole number: " + word};
  return *number;
}

int ToCommand(const std::string& word) {
  for (const NamedCommand& command : kNamedCommands) {
    if (word == command.name) return command.commandID;
  }
  const auto number = WholeNumber(word);
  if (!number) throw CommandError{"no such command: " + word};
  return *number;
}

int ToCard(const std::string& word) {
  const int card = WholeNumber(word).value_or(CardFromText(word));
  if (!IsCard(card)) throw CommandError{"no such card: " + word};
  return card;
}

platform::Point ToPoint(const std::vector<std::string>& words) {
  return {ToInt(words[1]), ToInt(words[2])};
}

double ToMoney(const std::string& word) {
  char* end = nullptr;
  const double value = std::strtod(word.c_str(), &end);
  if (end == word.c_str() || *end != '\0' || !std::isfinite(value)) {
    throw CommandError{"no amount of money: " + word};
  }
  return value;
}

platform::LocalTime ToTime(const std::string& word) {
  platform::LocalTime t{};
  const int read = std::sscanf(word.c_str(), "%4d-%2d-%2dT%2d:%2d:%2d", &t.year, &t.month, &t.day,
                               &t.hour, &t.minute, &t.second);
  if (!HasTimeShape(word) || read != 6 || !IsTime(t)) {
    throw CommandError{"no date and time: " + word};
  }
  return t;
}

}  // namespace feltside
