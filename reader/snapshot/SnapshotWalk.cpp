#include "reader/snapshot/SnapshotWalk.h"

#include <limits>

#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/ViewController.h"
#include "reader/snapshot/DataSeriesReading.h"
#include "reader/snapshot/NodeReading.h"

namespace ax::reader {

namespace {

constexpr std::size_t nowhere = std::numeric_limits<std::size_t>::max();

NodeId lastId = 0;

Ref<Array> reversed(const Ref<Array>& items) {
  return items ? array({items->items().rbegin(), items->items().rend()}) : nullptr;
}

}  // namespace

Snapshot SnapshotWalk::take(Object& screen) {
  snapshot_.screen_ = screen;
  visitScreen(screen);
  giveIds();
  snapshot_.timesRaised_ = questions_.raised();
  return std::move(snapshot_);
}

void SnapshotWalk::visitScreen(Object& screen) {
  const Place top{nowhere, 0};
  const Ref<Object> view = screen.isKindOf(ViewController::staticClass()) ? screen.safeValueForKey("view"_key)
                                                                          : Ref<Object>(&screen);
  if (const Ref<Object> modal = view ? frontMostModal(*view, 0) : nullptr) return visit(*modal, top);
  visit(screen, top);
}

// The one that is drawn last: it lies in front of the others.
Ref<Object> SnapshotWalk::frontMostModal(Object& view, std::size_t depth) {
  if (!isWithinDepth(depth) || !isVisible(view)) return nullptr;
  const std::vector<Ref<Object>> children = drawnChildren(view);
  for (auto child = children.rbegin(); child != children.rend(); ++child) {
    if (Ref<Object> modal = frontMostModal(**child, depth + 1)) return modal;
  }
  return questions_.ask(messages::accessibilityViewIsModal, view) ? Ref<Object>(&view) : nullptr;
}

void SnapshotWalk::visitEach(const Ref<Array>& objects, Place place) {
  if (!objects) return;
  for (const Ref<Object>& object : *objects) visit(*object, place);
}

void SnapshotWalk::visit(Object& object, Place place) {
  if (met_.contains(&object) || !isWithinDepth(place.depth) || !isWithinCount(met_.size())) return;
  met_.insert(&object);
  kept_.push_back(Ref<Object>(&object));
  if (!isVisible(object)) return visitInvisible(object, place);
  if (!questions_.ask(messages::isAccessibilityElement, object)) return visitContainer(object, place);
  Node node = readNode(object, questions_);
  node.isElement = true;
  node.series = readDataSeries(object, questions_);
  add(std::move(node), object, place);
}

bool SnapshotWalk::isVisible(Object& object) {
  bool isVisible = false;
  questions_.attempt([&] { isVisible = _accessibilityViewIsVisible(object); });
  return isVisible;
}

// A view may claim to be visible inside one that is not.
void SnapshotWalk::visitInvisible(Object& object, Place place) {
  for (const Ref<Object>& child : drawnChildren(object)) visit(*child, {place.parent, place.depth + 1});
}

// Containers that tell something of themselves become nodes if there is something in them.
void SnapshotWalk::visitContainer(Object& object, Place place) {
  Node node = readNode(object, questions_);
  node.series = readDataSeries(object, questions_);
  node.role = node.series ? Role::chart : Role::container;
  const bool isChart = node.series.has_value();
  const bool hasLabel = node.label && !node.label->text.empty();
  if (!isChart && !hasLabel && !node.states.modal) {
    return visitChildren(object, {place.parent, place.depth + 1});
  }
  const std::size_t index = snapshot_.nodes_.size();
  add(std::move(node), object, place);
  visitChildren(object, {index, place.depth + 1});
  if (!isChart && snapshot_.nodes_.size() == index + 1) dropLastNode();
}

void SnapshotWalk::visitChildren(Object& object, Place place) {
  if (const Ref<Array> listed = questions_.ask(messages::accessibilityElements, object)) {
    return visitEach(listed, place);
  }
  if (!object.isKindOf(ViewController::staticClass())) {
    return visitEach(childrenInReadingOrder(object), place);
  }
  visitNavigationItem(object, place);
  if (const Ref<Object> view = object.safeValueForKey("view"_key)) visit(*view, place);
}

Ref<Array> SnapshotWalk::childrenInReadingOrder(Object& object) {
  const Ref<Array> drawn = array(drawnChildren(object));
  Ref<Array> sorted;
  questions_.attempt([&] { sorted = sortedByGeometry(*drawn); });
  return sorted ? sorted : drawn;
}

void SnapshotWalk::visitNavigationItem(Object& controller, Place place) {
  const Ref<Object> item = controller.safeValueForKey("navigationItem"_key);
  visitEach(safeArrayForKey(item, "leftBarButtonItems"_key), place);
  Ref<String> title = safeStringForKey(item, "title"_key);
  if (isEmpty(title)) title = safeStringForKey(controller, "title"_key);
  if (item && !isEmpty(title)) addTitle(item, title, place);
  visitEach(reversed(safeArrayForKey(item, "rightBarButtonItems"_key)), place);
}

void SnapshotWalk::addTitle(const Ref<Object>& item, const Ref<String>& title, Place place) {
  const std::optional<AttributedText> spoken = questions_.askText(messages::accessibilityLabel, title);
  Node node;
  node.isElement = true;
  node.role = Role::header;
  node.traits = TraitHeader;
  node.label = spoken ? spoken : attributedText(*title);
  node.className = item->isa().name();
  add(std::move(node), *item, place);
}

void SnapshotWalk::add(Node node, Object& object, Place place) {
  const std::size_t index = snapshot_.nodes_.size();
  node.id = index + 1;
  if (place.parent != nowhere) {
    node.parent = place.parent + 1;
    snapshot_.nodes_[place.parent].children.push_back(node.id);
  }
  if (names_) node.objectId = names_(object);
  snapshot_.nodes_.push_back(std::move(node));
  snapshot_.objects_.push_back(object);
}

void SnapshotWalk::dropLastNode() {
  const NodeId parent = snapshot_.nodes_.back().parent;
  if (parent != 0) snapshot_.nodes_[parent - 1].children.pop_back();
  snapshot_.nodes_.pop_back();
  snapshot_.objects_.pop_back();
}

void SnapshotWalk::giveIds() {
  const NodeId before = lastId;
  lastId += snapshot_.nodes_.size();
  for (Node& node : snapshot_.nodes_) {
    node.id += before;
    if (node.parent != 0) node.parent += before;
    for (NodeId& child : node.children) child += before;
  }
}

Snapshot takeSnapshot(Receiver screen, const ObjectNames& names) {
  return screen.get() == nullptr ? Snapshot() : SnapshotWalk(names).take(*screen.get());
}

}  // namespace ax::reader
