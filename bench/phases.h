#pragma once

#include <string>
#include <vector>

#include "platform/draw/surface.h"

namespace feltside::bench {

/// A text at its place on the table.
struct PlacedText {
  std::string text;
  platform::Font font;
  platform::Color color;
  platform::Point at;
};

/// A picture of the game by number; icons have numbers of their own.
struct PlacedPicture {
  int number;
  platform::Point at;
  bool icon = false;
};

struct PlacedFill {
  platform::Rect rect;
  platform::Color color;
};

/// A screen of the table: how the game comes to it, and what is drawn there, in this order.
struct Phase {
  std::string name;
  std::string settings;
  std::vector<std::string> lines;
  std::vector<PlacedPicture> ground;
  std::vector<PlacedFill> fills;
  std::vector<PlacedPicture> pictures;
  std::vector<PlacedText> texts;
};

const std::vector<Phase>& Phases();

}  // namespace feltside::bench
