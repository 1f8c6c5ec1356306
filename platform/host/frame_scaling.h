#pragma once

#include <functional>

#include "platform/draw/bitmap.h"

namespace platform {

/// Takes a row of a scaled picture: its number from the top, and its pixels.
using RowSink = std::function<void(int y, const std::vector<Pixel>& row)>;

/// Scales a picture to another size, row by row from the top. At a whole multiple every pixel
/// becomes a square; between two of them it becomes what the next larger one would be, reduced
/// smoothly: a sharp square with edges that share a pixel with their neighbours.
void ScaleFrame(const CBitmap& frame, Size size, const RowSink& sink);

}  // namespace platform
