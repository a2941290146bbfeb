#pragma once

#include <algorithm>

namespace ax {

struct Point {
  double x = 0;
  double y = 0;
  bool operator==(const Point&) const = default;
};

struct Size {
  double width = 0;
  double height = 0;
  bool operator==(const Size&) const = default;
};

struct Insets {
  double top = 0;
  double left = 0;
  double bottom = 0;
  double right = 0;
  bool operator==(const Insets&) const = default;
};

// In points; y grows downward. Whether a rect is in screen space or in a view's own space is said where it
// is handed over.
struct Rect {
  double x = 0;
  double y = 0;
  double width = 0;
  double height = 0;

  double maxX() const { return x + width; }
  double maxY() const { return y + height; }
  Point center() const { return {x + width / 2, y + height / 2}; }
  bool isEmpty() const { return width <= 0 || height <= 0; }
  bool contains(Point p) const { return p.x >= x && p.x < maxX() && p.y >= y && p.y < maxY(); }
  Rect movedBy(Point offset) const { return {x + offset.x, y + offset.y, width, height}; }
  Rect unionWith(const Rect& other) const {
    const double left = std::min(x, other.x);
    const double top = std::min(y, other.y);
    return {left, top, std::max(maxX(), other.maxX()) - left, std::max(maxY(), other.maxY()) - top};
  }
  bool operator==(const Rect&) const = default;
};

}  // namespace ax
