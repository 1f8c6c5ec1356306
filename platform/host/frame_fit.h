#pragma once

#include "platform/draw/geometry.h"

namespace platform {

/// The size at which a picture is shown in a room: a whole multiple of its own where that takes at
/// least so many percent of what the room would allow, else all that the room allows. The picture's
/// shape stays; both sizes must be 1 × 1 at least.
Size FittingSize(Size frame, Size room, int leastPercent);

/// Where a picture stands in a room of another size, and which of its pixels are seen where. It
/// stands in the middle, at a whole multiple where that fills nine tenths of the room. Every host
/// shows its picture by this rule.
class FrameFit {
 public:
  FrameFit(Size frame, Size room);

  /// In pixels of the room.
  const Rect& Place() const { return m_rcPlace; }
  /// The pixel of the picture that a pixel of the room shows most of; may lie beside the picture.
  Point FramePoint(Point inRoom) const;
  /// The pixels of the room that FramePoint sees in a part of the picture.
  Rect RoomRect(const Rect& inFrame) const;

 private:
  Size m_frame;
  Rect m_rcPlace;
};

}  // namespace platform
