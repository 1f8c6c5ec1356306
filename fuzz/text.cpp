// Any text, measured, drawn, cut and wrapped: the one always says what the other does.

#include <algorithm>
#include <string>

#include "fuzz/bytes.h"
#include "platform/draw/look.h"
#include "platform/draw/utf8.h"
#include "platform/draw/wrapped_text.h"

namespace feltside::fuzz {
namespace {

using platform::Font;
using platform::kSystemFont;
using platform::MeasureText;

void Fit(const Font& font, const std::string& text, int room) {
  const platform::Size size = MeasureText(font, text);
  Require(platform::RenderText(font, text).GetSize() == size, "is drawn in another size");
  const std::size_t fitting = platform::FittingLength(font, text, room);
  Require(fitting <= text.size(), "more than all fits");
  Require(room < 0 || MeasureText(font, text.substr(0, fitting)).width <= room, "fits too much");
  if (fitting == text.size()) return;
  const std::string longer = text.substr(0, platform::NextLetter(text, fitting));
  Require(MeasureText(font, longer).width > room, "fits too little");
}

std::string WithoutBlanks(std::string text) {
  text.erase(std::remove(text.begin(), text.end(), ' '), text.end());
  return text;
}

void Wrap(const std::string& text, int width) {
  std::string all;
  for (const std::string& line : platform::WrapText(text, width)) {
    const bool fits = MeasureText(kSystemFont, platform::WithoutMnemonic(line)).width <= width;
    Require(fits || platform::NextLetter(line, 0) == line.size(), "a line is too wide: " + line);
    all += line;
  }
  Require(WithoutBlanks(all) == WithoutBlanks(text), "wrapping loses letters");
}

void Cut(const std::string& text, int width) {
  const int ellipsis = MeasureText(kSystemFont, "\u2026").width;
  const std::string cut = platform::Ellipsized(text, width);
  Require(MeasureText(kSystemFont, cut).width <= std::max(width, ellipsis), "is cut too little");
}

}  // namespace
}  // namespace feltside::fuzz

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace feltside::fuzz;
  CBytes bytes(data, size);
  const platform::Font font{bytes.Number(9, 24), bytes.Number(0, 1) == 1};
  const int room = bytes.Number(-5, 250);
  const std::string text = bytes.Rest();
  Fit(font, text, room);
  Wrap(text, room);
  Cut(text, room);
  const std::string line = platform::OneLine(text);
  Require(platform::OneLine(line) == line, "one line is not yet one");
  return 0;
}
