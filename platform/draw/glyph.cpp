#include "platform/draw/glyph.h"

#include <algorithm>

namespace platform {

Glyph::Glyph() : begins(), ends() {
  begins.fill(kFar);
  ends.fill(-kFar);
}

void Glyph::Add(const Run& run) {
  runs.push_back(run);
  right = std::max(right, run.right);
  const auto row = static_cast<std::size_t>(run.y);
  ends[row] = std::max(ends[row], run.right);
  for (std::size_t y = row - std::min<std::size_t>(row, 1); y <= row + 1 && y < kRows; ++y) {
    begins[y] = std::min(begins[y], run.left);
  }
}

}  // namespace platform
