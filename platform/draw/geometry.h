#pragma once

namespace platform {

/// A place in whole pixels, x growing to the right and y downwards.
struct Point {
  int x = 0;
  int y = 0;

  friend constexpr Point operator+(Point a, Point b) { return {a.x + b.x, a.y + b.y}; }
  friend constexpr Point operator-(Point a, Point b) { return {a.x - b.x, a.y - b.y}; }
  friend constexpr bool operator==(Point, Point) = default;
};

/// An extent in whole pixels.
struct Size {
  int width = 0;
  int height = 0;

  friend constexpr bool operator==(Size, Size) = default;
};

/// A rectangle of pixels: left and top belong to it, right and bottom do not.
struct Rect {
  int left = 0;
  int top = 0;
  int right = 0;
  int bottom = 0;

  constexpr int Width() const { return right - left; }
  constexpr int Height() const { return bottom - top; }
  constexpr Point TopLeft() const { return {left, top}; }
  constexpr bool IsEmpty() const { return right <= left || bottom <= top; }
  constexpr bool Contains(Point p) const {
    return left <= p.x && p.x < right && top <= p.y && p.y < bottom;
  }
  constexpr Rect Moved(Point by) const {
    return {left + by.x, top + by.y, right + by.x, bottom + by.y};
  }
  constexpr Rect Shrunk(int by) const { return {left + by, top + by, right - by, bottom - by}; }
  /// The part that both cover; empty where they do not meet.
  constexpr Rect Intersection(const Rect& other) const {
    return {left > other.left ? left : other.left, top > other.top ? top : other.top,
            right < other.right ? right : other.right,
            bottom < other.bottom ? bottom : other.bottom};
  }

  friend constexpr bool operator==(const Rect&, const Rect&) = default;
};

constexpr Rect RectAt(Point at, Size size) {
  return {at.x, at.y, at.x + size.width, at.y + size.height};
}

}  // namespace platform
