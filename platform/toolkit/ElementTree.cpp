#include "platform/toolkit/ElementTree.h"

#include <algorithm>
#include <utility>

#include "platform/formatting/Region.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/View.h"

namespace ax {

namespace {

void collectSubviews(View& view, const ElementTest& test, Array::Items& found, std::size_t level) {
  for (const Ref<View>& subview : view.subviews()) {
    if (!isWithinDepth(level)) return;
    if (test(*subview)) found.push_back(subview);
    collectSubviews(*subview, test, found, level + 1);
  }
}

// The objects that a walk is inside of.
struct Path {
  Object& object;
  const Path* above;
  std::size_t level = 0;

  bool holds(const Object& other) const {
    return &object == &other || (above != nullptr && above->holds(other));
  }
};

void visitBelow(const Path& path, const ElementTest& visit, std::size_t& met) {
  const Ref<Array> listed = messages::accessibilityElements(path.object);
  for (const Ref<Object>& child : listed ? listed->items() : drawnChildren(path.object)) {
    if (path.holds(*child)) continue;
    if (!isWithinDepth(path.level) || !isWithinCount(met++)) return;
    if (visit(*child)) visitBelow({*child, &path, path.level + 1}, visit, met);
  }
}

bool isMarkedVisible(const Object& object) {
  const AccessibilityProperties* properties = AccessibilityProperties::find(object);
  return properties != nullptr && properties->isMarkedVisible && properties->overridesInvisibility;
}

bool isDrawn(Object& object) {
  if (const View* view = cast<View>(&object)) return !view->isHidden() && view->alpha() > 0;
  if (const Layer* layer = cast<Layer>(&object)) return !layer->isHidden() && layer->opacity() > 0;
  return true;
}

struct Placed {
  Ref<Object> element;
  Rect frame;
};

bool beginsBefore(const Rect& a, const Rect& b, bool rightToLeft) {
  return rightToLeft ? a.maxX() > b.maxX() : a.x < b.x;
}

bool standInOneRow(const Rect& upper, const Rect& lower) {
  return lower.y < upper.y + upper.height / 2 || lower.y == upper.y;
}

}  // namespace

Ref<Object> _accessibilityFindAncestor(Receiver receiver, const ElementTest& test, bool startWithSelf) {
  Ref<Object> object(receiver.get());
  if (!startWithSelf) object = messages::accessibilityContainer(object);
  Ref<Object> milestone = object;
  for (std::size_t steps = 0, lap = 1; object && !test(*object); ++steps) {
    if (!isWithinDepth(steps)) return nullptr;
    if (steps == lap) {
      milestone = object;
      lap += steps + 1;
    }
    object = messages::accessibilityContainer(object);
    if (object == milestone) return nullptr;
  }
  return object;
}

Ref<Object> _accessibilityAncestorIsKindOf(Receiver receiver, const Class* ancestorClass) {
  return _accessibilityFindAncestor(
      receiver, [&](Object& object) { return object.isKindOf(ancestorClass); }, false);
}

Ref<Array> _accessibilityFindSubviewDescendantsPassingTest(Receiver receiver, const ElementTest& test) {
  Array::Items found;
  if (View* view = cast<View>(receiver.get())) collectSubviews(*view, test, found, 0);
  return array(std::move(found));
}

Ref<Array> _accessibilityFindUnsortedDescendantsPassingTest(Receiver receiver, const ElementTest& test) {
  Array::Items found;
  visitDescendants(receiver, [&](Object& object) {
    if (test(object)) found.push_back(Ref<Object>(&object));
    return true;
  });
  return array(std::move(found));
}

void visitDescendants(Receiver parent, const ElementTest& visit) {
  std::size_t met = 0;
  if (parent.get() != nullptr) visitBelow({*parent.get(), nullptr}, visit, met);
}

bool _accessibilityViewIsVisible(Receiver receiver) {
  if (receiver.get() == nullptr) return false;
  const Ref<Object> deciding = _accessibilityFindAncestor(
      receiver, [](Object& object) { return isMarkedVisible(object) || !isDrawn(object); }, true);
  return !deciding || isMarkedVisible(*deciding);
}

std::vector<Ref<Object>> drawnChildren(Object& parent) {
  std::vector<Ref<Object>> children;
  if (const View* view = cast<View>(&parent)) {
    children.assign(view->subviews().begin(), view->subviews().end());
    if (view->layerIfAny() != nullptr) {
      const auto& layers = view->layerIfAny()->sublayers();
      children.insert(children.end(), layers.begin(), layers.end());
    }
  } else if (const Layer* layer = cast<Layer>(&parent)) {
    children.assign(layer->sublayers().begin(), layer->sublayers().end());
  }
  return children;
}

Rect frameForElements(const Ref<Array>& elements) {
  Rect all;
  if (!elements) return all;
  bool isFirst = true;
  for (const Ref<Object>& element : *elements) {
    const PartQuestion question(messages::accessibilityFrame.selector(), element);
    if (!question.mayBePut()) continue;
    const Rect frame = messages::accessibilityFrame(element);
    all = std::exchange(isFirst, false) ? frame : all.unionWith(frame);
  }
  return all;
}

Rect convertFrameToScreenCoordinates(Rect rect, Receiver view) {
  const Responder* responder = cast<Responder>(view.get());
  return responder == nullptr ? rect : responder->screenRect(rect);
}

int accessibilityCompareGeometry(Object& a, Object& b) {
  const Rect first = messages::accessibilityFrame(a);
  const Rect second = messages::accessibilityFrame(b);
  const bool oneRow = first.y <= second.y ? standInOneRow(first, second) : standInOneRow(second, first);
  if (!oneRow) return first.y < second.y ? -1 : 1;
  const bool rightToLeft = formatting::currentLanguageIsRightToLeft();
  if (beginsBefore(first, second, rightToLeft)) return -1;
  return beginsBefore(second, first, rightToLeft) ? 1 : 0;
}

Ref<Array> sortedByGeometry(const Array& elements) {
  std::vector<Placed> placed;
  for (const Ref<Object>& element : elements)
    placed.push_back({element, messages::accessibilityFrame(element)});
  std::stable_sort(placed.begin(), placed.end(),
                   [](const Placed& a, const Placed& b) { return a.frame.y < b.frame.y; });
  const bool rightToLeft = formatting::currentLanguageIsRightToLeft();
  for (auto row = placed.begin(); row != placed.end();) {
    const auto rowEnd = std::find_if(row + 1, placed.end(),
                                     [&](const Placed& p) { return !standInOneRow(row->frame, p.frame); });
    std::stable_sort(row, rowEnd, [&](const Placed& a, const Placed& b) {
      return beginsBefore(a.frame, b.frame, rightToLeft);
    });
    row = rowEnd;
  }
  Array::Items sorted;
  for (Placed& p : placed) sorted.push_back(std::move(p.element));
  return array(std::move(sorted));
}

}  // namespace ax
