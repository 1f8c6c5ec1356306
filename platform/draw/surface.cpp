#include "platform/draw/surface.h"

#include <algorithm>
#include <utility>

namespace platform {
namespace {
/// What is copied is never see-through.
constexpr Pixel kOpaqueBits = 0xFF000000U;
}  // namespace

CSurface::CSurface(CBitmap& target) : CSurface(target, target.Bounds()) {}

CSurface::CSurface(CBitmap& target, const Rect& part) : m_pTarget(&target), m_rcPart(part) {}

CSurface::CSurface(const CSurface& whole, const Rect& part)
    : CSurface(*whole.m_pTarget,
               part.Moved(whole.m_rcPart.TopLeft()).Intersection(whole.m_rcPart)) {}

Font CSurface::SetFont(const Font& font) { return std::exchange(m_state.font, font); }
Color CSurface::SetTextColor(Color color) { return std::exchange(m_state.textColor, color); }
Color CSurface::SetBackColor(Color color) { return std::exchange(m_state.backColor, color); }
BackMode CSurface::SetBackMode(BackMode mode) { return std::exchange(m_state.backMode, mode); }
Color CSurface::SetBrush(Color color) { return std::exchange(m_state.brush, color); }
Color CSurface::SetPen(Color color) { return std::exchange(m_state.pen, color); }

Rect CSurface::Visible(const Rect& rect) const {
  return rect.Moved(m_rcPart.TopLeft()).Intersection(m_rcPart).Intersection(m_pTarget->Bounds());
}

/// Calls the rule with each pixel of the rectangle that the target has, and its place on this
/// surface.
template <class PixelRule>
void CSurface::EachPixel(const Rect& rect, PixelRule rule) {
  const Rect visible = Visible(rect);
  for (int y = visible.top; y < visible.bottom; ++y) {
    for (int x = visible.left; x < visible.right; ++x) {
      rule(m_pTarget->At({x, y}), Point{x, y} - m_rcPart.TopLeft());
    }
  }
}

// Filling and copying are most of a frame's work, so they go by whole rows.

void CSurface::FillRect(const Rect& rect, Color color) {
  const Rect visible = Visible(rect);
  if (visible.IsEmpty()) return;
  for (int y = visible.top; y < visible.bottom; ++y) {
    std::fill_n(&m_pTarget->At({visible.left, y}), visible.Width(), ToPixel(color));
  }
}

void CSurface::Rectangle(const Rect& rect) {
  FillRect(rect, m_state.pen);
  FillRect(rect.Shrunk(1), m_state.brush);
}

void CSurface::Line(Point from, Point to) {
  if (from.y == to.y) {
    FillRect({std::min(from.x, to.x), from.y, std::max(from.x, to.x), from.y + 1}, m_state.pen);
  } else {
    FillRect({from.x, std::min(from.y, to.y), from.x + 1, std::max(from.y, to.y)}, m_state.pen);
  }
}

void CSurface::BitBlt(Point at, Size size, const CBitmap& source, Point sourceAt, RasterOp op) {
  const Point shift = at - sourceAt;
  const Rect visible = Visible(RectAt(at, size).Intersection(source.Bounds().Moved(shift)));
  if (visible.IsEmpty()) return;
  const Point toSource = Point{} - shift - m_rcPart.TopLeft();
  for (int y = visible.top; y < visible.bottom; ++y) {
    const Pixel* from = &source.At(Point{visible.left, y} + toSource);
    Pixel* to = &m_pTarget->At({visible.left, y});
    if (op == RasterOp::kAnd) {
      std::transform(from, from + visible.Width(), to, to,
                     [](Pixel a, Pixel b) { return (a | kOpaqueBits) & b; });
    } else {
      std::transform(from, from + visible.Width(), to, [](Pixel a) { return a | kOpaqueBits; });
    }
  }
}

void CSurface::StretchBlt(const Rect& to, const CBitmap& source, const Rect& from) {
  if (to.IsEmpty()) return;
  const Size size{from.Width(), from.Height()};
  if (to == RectAt(to.TopLeft(), size)) return BitBlt(to.TopLeft(), size, source, from.TopLeft());
  EachPixel(to, [&](Pixel& target, Point p) {
    const Point sample{from.left + (p.x - to.left) * from.Width() / to.Width(),
                       from.top + (p.y - to.top) * from.Height() / to.Height()};
    if (source.Bounds().Contains(sample)) target = source.At(sample) | kOpaqueBits;
  });
}

void CSurface::DrawIcon(Point at, const CBitmap& icon) {
  EachPixel(RectAt(at, icon.GetSize()), [&](Pixel& target, Point p) {
    const Pixel pixel = icon.At(p - at);
    if (IsOpaque(pixel)) target = pixel;
  });
}

void CSurface::DrawStencil(Point at, const CBitmap& stencil, Color color) {
  EachPixel(RectAt(at, stencil.GetSize()), [&](Pixel& target, Point p) {
    if (IsOpaque(stencil.At(p - at))) target = ToPixel(color);
  });
}

Size CSurface::TextExtent(const std::string& text) const { return MeasureText(m_state.font, text); }

void CSurface::TextOut(Point at, const std::string& text) {
  const CBitmap stencil = RenderText(m_state.font, text);
  if (m_state.backMode == BackMode::kOpaque) {
    FillRect(RectAt(at, stencil.GetSize()), m_state.backColor);
  }
  DrawStencil(at, stencil, m_state.textColor);
}

void CSurface::DrawText(const Rect& rect, const std::string& text, TextAlign align) {
  const int spare = rect.Width() - TextExtent(text).width;
  const int indent = align == TextAlign::kLeft ? 0 : align == TextAlign::kRight ? spare : spare / 2;
  CSurface line(*m_pTarget, rect.Moved(m_rcPart.TopLeft()).Intersection(m_rcPart));
  line.m_state = m_state;
  line.TextOut(Point{rect.left + indent, rect.top} + m_rcPart.TopLeft() - line.m_rcPart.TopLeft(),
               text);
}

}  // namespace platform
