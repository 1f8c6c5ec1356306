#include "platform/draw/wrapped_text.h"

#include <algorithm>

#include "platform/draw/look.h"
#include "platform/draw/utf8.h"

namespace platform {
namespace {

int WidthOf(const std::string& text) {
  return MeasureText(kSystemFont, WithoutMnemonic(text)).width;
}

/// Breaks the last of some lines, which is one word, until it is no wider than so many pixels.
void BreakLastWord(std::vector<std::string>& lines, int width) {
  while (WidthOf(lines.back()) > width) {
    const std::string word = lines.back();
    std::size_t end = FittingLength(kSystemFont, word, width);
    const std::size_t slash = word.substr(0, end).rfind('/');
    if (slash != std::string::npos && slash > 0) end = slash + 1;
    end = std::max(end, NextLetter(word, 0));  // where not even one letter fits
    if (end == word.size()) return;
    lines.back() = word.substr(0, end);
    lines.push_back(word.substr(end));
  }
}

}  // namespace

std::vector<std::string> WrapText(const std::string& text, int width) {
  std::vector<std::string> lines(1);
  std::size_t from = 0;
  while (from <= text.size()) {
    const std::size_t blank = std::min(text.find(' ', from), text.size());
    const std::string word = text.substr(from, blank - from);
    const std::string longer = lines.back() + (from == 0 ? "" : " ") + word;
    if (from > 0 && WidthOf(longer) > width) {
      lines.push_back(word);
    } else {
      lines.back() = longer;
    }
    BreakLastWord(lines, width);
    from = blank + 1;
  }
  return lines;
}

std::string Ellipsized(const std::string& text, int width) {
  if (MeasureText(kSystemFont, text).width <= width) return text;
  const std::string ellipsis = "\xE2\x80\xA6";
  const std::size_t blank = text.rfind(' ');
  std::string end = ellipsis + (blank == std::string::npos ? "" : text.substr(blank));
  // A last word that leaves little room is cut like the rest.
  if (MeasureText(kSystemFont, end).width > width / 2) end = ellipsis;
  const int room = width - MeasureText(kSystemFont, end).width;
  return text.substr(0, FittingLength(kSystemFont, text, room)) + end;
}

}  // namespace platform
