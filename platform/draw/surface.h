#pragma once

#include <string>

#include "platform/draw/bitmap.h"
#include "platform/draw/text.h"

namespace platform {

enum class RasterOp { kCopy, kAnd };
enum class BackMode { kTransparent, kOpaque };
enum class TextAlign { kLeft, kRight, kCenter };

/// What the drawing calls of a surface draw with.
struct DrawState {
  Font font;
  Color textColor = kBlack;
  Color backColor = kWhite;
  BackMode backMode = BackMode::kOpaque;
  Color brush = kWhite;  ///< fills
  Color pen = kBlack;    ///< lines and outlines, one pixel wide
};

/// Draws into a bitmap that it does not own: the whole of it, or a part whose top-left corner then
/// is (0, 0). Everything is clipped to that part.
///
/// The setters return what was set before, so that an operation can put it back.
class CSurface {
 public:
  explicit CSurface(CBitmap& target);
  CSurface(CBitmap& target, const Rect& part);
  /// A part of another surface, in a drawing state of its own.
  CSurface(const CSurface& whole, const Rect& part);

  Rect Bounds() const { return RectAt({}, {m_rcPart.Width(), m_rcPart.Height()}); }

  Font SetFont(const Font& font);
  Color SetTextColor(Color color);
  Color SetBackColor(Color color);
  BackMode SetBackMode(BackMode mode);
  Color SetBrush(Color color);
  Color SetPen(Color color);

  void FillRect(const Rect& rect, Color color);
  /// Fills with the brush and outlines with the pen, inside the rectangle's edges.
  void Rectangle(const Rect& rect);
  /// A straight horizontal or vertical line with the pen, up to but without its end.
  void Line(Point from, Point to);

  /// Copies a block of the source, whose top-left corner there is `sourceAt`, to `at`. What lies
  /// outside the source is left alone.
  void BitBlt(Point at, Size size, const CBitmap& source, Point sourceAt = {},
              RasterOp op = RasterOp::kCopy);
  /// Copies a block of the source into a rectangle of another size, by the nearest pixel.
  void StretchBlt(const Rect& to, const CBitmap& source, const Rect& from);
  /// Draws the opaque pixels of an icon.
  void DrawIcon(Point at, const CBitmap& icon);
  /// Draws the opaque pixels of a stencil in one colour.
  void DrawStencil(Point at, const CBitmap& stencil, Color color);

  Size TextExtent(const std::string& text) const;
  /// The text with its top-left corner at a place. In opaque mode it stands on a cell of the
  /// background colour.
  void TextOut(Point at, const std::string& text);
  /// One line of text at the top of a rectangle and clipped to it.
  void DrawText(const Rect& rect, const std::string& text, TextAlign align);

 private:
  friend class SavedState;
  /// The part of a rectangle that the target has, in the target's pixels.
  Rect Visible(const Rect& rect) const;
  template <class PixelRule>
  void EachPixel(const Rect& rect, PixelRule rule);

  CBitmap* m_pTarget;
  Rect m_rcPart;
  DrawState m_state;
};

/// Puts a surface's drawing state back when it goes out of scope.
class SavedState {
 public:
  explicit SavedState(CSurface& surface) : m_surface(surface), m_state(surface.m_state) {}
  ~SavedState() { m_surface.m_state = m_state; }
  SavedState(const SavedState&) = delete;
  SavedState& operator=(const SavedState&) = delete;

 private:
  CSurface& m_surface;
  DrawState m_state;
};

}  // namespace platform
