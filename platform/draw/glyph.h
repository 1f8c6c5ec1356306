#pragma once

#include <array>
#include <cstddef>
#include <vector>

namespace platform {

/// A letter as a face draws it, in pixels seen from the pen on the cell's top. Nothing of it stands
/// above or below the cell.
struct Glyph {
  /// Ink side by side in one row: left belongs to it, right does not.
  struct Run {
    short y;
    short left;
    short right;
  };
  static constexpr short kFar = 10000;  ///< wider than any glyph
  static constexpr std::size_t kRows = 22;
  /// A place in each row of the highest cell.
  using Outline = std::array<short, kRows>;

  std::vector<Run> runs;
  Outline begins;       ///< the first column with ink in the row or the ones above and below it
  Outline ends;         ///< where the row's ink ends
  short right = 0;      ///< where all ink ends
  short advance = 0;    ///< to the next pen
  unsigned number = 0;  ///< in its face

  Glyph();
  void Add(const Run& run);
};

}  // namespace platform
