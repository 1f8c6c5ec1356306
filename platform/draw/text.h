#pragma once

#include <cstddef>
#include <string>

#include "platform/draw/bitmap.h"
#include "platform/draw/geometry.h"

namespace platform {

/// A face of the one type family, by its cell height in pixels: 11, 13, 14, 15 or 22. Any other
/// height takes the nearest of these.
struct Font {
  int height = 13;
  bool bold = false;
};

/// The extent of a UTF-8 text in pixels, from its first letter's ink or pen to the last one's; an
/// empty text is 0 wide and a cell high. A text's width is not the sum of its parts': letters are
/// moved closer or apart by their neighbours.
Size MeasureText(const Font& font, const std::string& text);

/// How much of a text, in bytes and whole letters from its start, MeasureText calls at most so many
/// pixels wide; 0 for a width below 0.
std::size_t FittingLength(const Font& font, const std::string& text, int width);

/// The text as a stencil of its extent: opaque pixels where ink stands, see-through ones elsewhere.
/// A letter that no face has shows as a box; one that memory does not suffice for is left out,
/// and shows the next time.
CBitmap RenderText(const Font& font, const std::string& text);

}  // namespace platform
