#include <algorithm>

#include "reader/audit/AuditRule.h"

// Where elements stand.
namespace ax::reader {

namespace {

constexpr double smallestTarget = 24;
constexpr double tolerance = 0.5;  // points; frames are rounded here and there

bool hasArea(const Rect& frame) {
  return frame.width > 0 && frame.height > 0;
}

double sharedWidth(const Rect& a, const Rect& b) {
  return std::min(a.maxX(), b.maxX()) - std::max(a.x, b.x);
}

double sharedHeight(const Rect& a, const Rect& b) {
  return std::min(a.maxY(), b.maxY()) - std::max(a.y, b.y);
}

bool meet(const Rect& a, const Rect& b) {
  return sharedWidth(a, b) > tolerance && sharedHeight(a, b) > tolerance;
}

// What stands in a navigation bar is drawn by the system, which alone knows where.
bool isPlacedByHost(const Node& node) {
  return node.className != "NavigationItem" && node.className != "BarButtonItem";
}

std::string sizeOf(const Rect& frame) {
  const auto points = [](double length) { return std::to_string(static_cast<long long>(length)); };
  return points(frame.width) + " by " + points(frame.height) + " points";
}

// Whether something stands wholly before another in the direction of reading.
bool standsBefore(const Rect& a, const Rect& b, bool isRightToLeft) {
  return isRightToLeft ? a.x >= b.maxX() - tolerance : a.maxX() <= b.x + tolerance;
}

bool standInOneRow(const Rect& a, const Rect& b) {
  return sharedHeight(a, b) > std::min(a.height, b.height) / 2;
}

// Why `next`, read right after `first`, should have been read before it; empty when the order is right. What
// stands higher but in a later column belongs to that column.
std::string disorder(const Rect& first, const Rect& next, bool isRightToLeft) {
  if (standInOneRow(first, next)) {
    return standsBefore(next, first, isRightToLeft) ? "which stands before it in its row" : "";
  }
  const bool isAbove = next.maxY() <= first.y + tolerance;
  return isAbove && !standsBefore(first, next, isRightToLeft) ? "which stands above it" : "";
}

// A chart runs along its own axis, in every language alike.
bool standInOneChart(const Snapshot& snapshot, const Node& a, const Node& b) {
  const Node* parent = a.parent == b.parent ? snapshot.node(a.parent) : nullptr;
  return parent != nullptr && parent->series;
}

}  // namespace

void findMissingAreas(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (const AuditedElement& element : screen.elements) {
    if (isPlacedByHost(*element.node) && !hasArea(element.node->frame)) {
      problems.push_back(problemOf(element, "has no area"));
    }
  }
}

void findOutsideScreen(const Audit&, const AuditScreen& screen, Problems& problems) {
  if (!hasArea(screen.shown.area)) return;
  for (const AuditedElement& element : screen.elements) {
    const Rect& frame = element.node->frame;
    const bool canScroll = screen.shown.scrollable.contains(element.node->id);
    if (hasArea(frame) && !canScroll && !meet(frame, screen.shown.area)) {
      problems.push_back(problemOf(element, "lies outside the screen"));
    }
  }
}

void findSmallTargets(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (const AuditedElement& element : screen.elements) {
    const Rect& frame = element.node->frame;
    const bool isSmall = frame.width < smallestTarget || frame.height < smallestTarget;
    if (isOperable(*element.node) && hasArea(frame) && isSmall) {
      problems.push_back(problemOf(element, "is " + sizeOf(frame)));
    }
  }
}

void findOverlaps(const Audit&, const AuditScreen& screen, Problems& problems) {
  std::vector<const AuditedElement*> operable;
  for (const AuditedElement& element : screen.elements) {
    if (isOperable(*element.node)) operable.push_back(&element);
  }
  std::ranges::stable_sort(operable, {}, [](const AuditedElement* e) { return e->node->frame.y; });
  for (auto upper = operable.begin(); upper != operable.end(); ++upper) {
    const Rect& frame = (*upper)->node->frame;
    for (auto lower = upper + 1; lower != operable.end() && (*lower)->node->frame.y < frame.maxY(); ++lower) {
      if (meet(frame, (*lower)->node->frame)) {
        problems.push_back(problemOf(**lower, "lies over \"" + (*upper)->line + "\""));
      }
    }
  }
}

void findOutOfOrder(const Audit&, const AuditScreen& screen, Problems& problems) {
  for (std::size_t i = 1; i < screen.elements.size(); ++i) {
    const AuditedElement& first = screen.elements[i - 1];
    const AuditedElement& next = screen.elements[i];
    const bool havePlaces = hasArea(first.node->frame) && hasArea(next.node->frame);
    if (!havePlaces || standInOneChart(screen.snapshot, *first.node, *next.node)) continue;
    const bool staysAround =
        screen.shown.fromTheLeft.contains(first.node->id) && screen.shown.fromTheLeft.contains(next.node->id);
    const bool isRightToLeft = screen.isRightToLeft && !staysAround;
    const std::string why = disorder(first.node->frame, next.node->frame, isRightToLeft);
    if (!why.empty()) problems.push_back(problemOf(first, "is read before \"" + next.line + "\", " + why));
  }
}

}  // namespace ax::reader
