#include "platform/host/frame_fit.h"

#include <algorithm>

namespace platform {
namespace {

/// What a whole multiple must fill of the room, as it is sharper than anything between.
constexpr int kLeastPercent = 90;

/// Rounds downwards for negative values too.
constexpr int FloorDivide(int value, int by) {
  return value >= 0 ? value / by : -((by - 1 - value) / by);
}

/// The cell of a row of cells that lies under the middle of a cell of another row of the same
/// length.
constexpr int CellUnder(int cell, int cells, int others) {
  return FloorDivide((2 * cell + 1) * others, 2 * cells);
}

/// The first cell of a row under whose middle a cell of another row, or one behind it, lies.
constexpr int FirstCellOver(int other, int others, int cells) {
  return FloorDivide(2 * other * cells + others - 1, 2 * others);
}

}  // namespace

Size FittingSize(Size frame, Size room, int leastPercent) {
  const bool byWidth = room.width * frame.height <= room.height * frame.width;
  const int length = byWidth ? room.width : room.height;
  const int unit = byWidth ? frame.width : frame.height;
  const int multiple = length / unit;
  if (multiple * unit * 100 >= length * leastPercent) {
    return {frame.width * multiple, frame.height * multiple};
  }
  const auto scaled = [=](int side) { return std::max(1, (side * length + unit / 2) / unit); };
  return {scaled(frame.width), scaled(frame.height)};
}

FrameFit::FrameFit(Size frame, Size room) : m_frame(frame) {
  const Size size = FittingSize(frame, room, kLeastPercent);
  m_rcPlace = RectAt({(room.width - size.width) / 2, (room.height - size.height) / 2}, size);
}

Point FrameFit::FramePoint(Point inRoom) const {
  const Point at = inRoom - m_rcPlace.TopLeft();
  return {CellUnder(at.x, m_rcPlace.Width(), m_frame.width),
          CellUnder(at.y, m_rcPlace.Height(), m_frame.height)};
}

Rect FrameFit::RoomRect(const Rect& inFrame) const {
  const auto across = [this](int x) { return FirstCellOver(x, m_frame.width, m_rcPlace.Width()); };
  const auto down = [this](int y) { return FirstCellOver(y, m_frame.height, m_rcPlace.Height()); };
  return Rect{across(inFrame.left), down(inFrame.top), across(inFrame.right), down(inFrame.bottom)}
      .Moved(m_rcPlace.TopLeft());
}

}  // namespace platform
