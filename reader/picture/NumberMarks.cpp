#include "reader/picture/NumberMarks.h"

#include <algorithm>
#include <cmath>

namespace ax::reader {

namespace {

// In parts of the type's size.
constexpr double digitWidth = 0.62;
constexpr double sideMargins = 0.5;
constexpr double lineHeight = 1.3;
constexpr double smallestType = 1;
constexpr double inset = 1;
constexpr double cellSize = 32;
constexpr std::size_t mostInCell = 64;  // more than are told apart there
constexpr int mostTries = 64;

bool overlap(const Rect& a, const Rect& b) {
  return a.x < b.maxX() && b.x < a.maxX() && a.y < b.maxY() && b.y < a.maxY();
}

double typeThatFits(const Rect& frame, std::size_t digits) {
  const double byWidth = (frame.width - 2 * inset) / (digitWidth * double(digits) + sideMargins);
  const double byHeight = (frame.height - 2 * inset) / lineHeight;
  return std::clamp(std::min(byWidth, byHeight), smallestType, NumberMarks::largestType);
}

}  // namespace

Size NumberMarks::sizeOf(double fontSize, std::size_t digits) {
  return {(digitWidth * double(digits) + sideMargins) * fontSize, lineHeight * fontSize};
}

NumberMarks::Mark NumberMarks::place(const Rect& frame, std::size_t digits) {
  const double fontSize = typeThatFits(frame, digits);
  const Size size = sizeOf(fontSize, digits);
  const auto columns = std::max(1, int((frame.width - inset) / (size.width + inset)));
  const auto rows = std::max(1, int((frame.height - inset) / (size.height + inset)));
  const auto at = [&](int i) {
    const int row = i / columns;
    const double along = inset + (i % columns) * (size.width + inset);
    const double x = fromTheRight_ ? frame.maxX() - along - size.width : frame.x + along;
    return Rect{x, frame.y + inset + row * (size.height + inset), size.width, size.height};
  };
  Rect chosen = at(0);
  for (int i = 0; i < std::min(mostTries, columns * rows); ++i) {
    if (!isFree(at(i))) continue;
    chosen = at(i);
    break;
  }
  take(chosen);
  return {chosen, fontSize};
}

template <class Visit>
void NumberMarks::eachCell(const Rect& rect, Visit&& visit) {
  constexpr std::int64_t rowLength = 1 << 20;
  const auto cell = [](double at) { return std::int64_t(std::floor(at / cellSize)); };
  for (std::int64_t row = cell(rect.y); row <= cell(rect.maxY()); ++row) {
    for (std::int64_t column = cell(rect.x); column <= cell(rect.maxX()); ++column) {
      visit(row * rowLength + column);
    }
  }
}

bool NumberMarks::isFree(const Rect& rect) const {
  bool isFree = true;
  eachCell(rect, [&](std::int64_t cell) {
    const auto found = taken_.find(cell);
    if (found == taken_.end()) return;
    isFree &= std::ranges::none_of(found->second, [&](const Rect& other) { return overlap(rect, other); });
  });
  return isFree;
}

void NumberMarks::take(const Rect& rect) {
  eachCell(rect, [&](std::int64_t cell) {
    std::vector<Rect>& here = taken_[cell];
    if (here.size() < mostInCell) here.push_back(rect);
  });
}

}  // namespace ax::reader
