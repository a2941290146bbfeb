#include <unordered_map>

#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/ViewController.h"
#include "reader/snapshot/HostQuestions.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

namespace {

View* viewOf(const Ref<Object>& screen) {
  if (screen && screen->isKindOf(ViewController::staticClass())) {
    return safeUIViewForKey(screen, "view"_key).get();
  }
  return cast<View>(screen.get());
}

bool answersHitTests(const View& view) {
  const Method& method = view.isa().lookUp(messages::_accessibilityHitTest.selector());
  return method.function != nullptr && (method.owner != &View::staticClass() || method.graft != nullptr);
}

bool isVisible(View& view, HostQuestions& questions) {
  bool isVisible = false;
  questions.attempt([&] { isVisible = _accessibilityViewIsVisible(view); });
  return isVisible;
}

bool contains(const View& view, Point point) {
  return view.screenRect(view.bounds()).contains(point);
}

// The front-most of the deepest ones. Views may show what lies outside them; only scroll views cut it off.
View* deepestAnsweringView(View& view, Point point, HostQuestions& questions, std::size_t level) {
  const bool isHit = contains(view, point);
  if (!isWithinDepth(level) || !isVisible(view, questions)) return nullptr;
  if (cast<ScrollView>(&view) != nullptr && !isHit) return nullptr;
  const auto& subviews = view.subviews();
  for (auto subview = subviews.rbegin(); subview != subviews.rend(); ++subview) {
    if (View* found = deepestAnsweringView(**subview, point, questions, level + 1)) return found;
  }
  return isHit && answersHitTests(view) ? &view : nullptr;
}

Ref<Object> answerOf(View& view, Point point, HostQuestions& questions) {
  const Rect origin = view.screenRect({});
  return questions.ask(messages::_accessibilityHitTest, view, Point{point.x - origin.x, point.y - origin.y},
                       nullptr);
}

using DrawingOrder = std::unordered_map<const Object*, std::size_t>;

void numberDrawn(Object& object, DrawingOrder& order, std::size_t level) {
  if (!isWithinDepth(level) || !order.emplace(&object, order.size()).second) return;
  for (const Ref<Object>& child : drawnChildren(object)) numberDrawn(*child, order, level + 1);
}

// What is not drawn itself lies where its nearest drawn ancestor does.
std::size_t depthInDrawing(Object& object, const DrawingOrder& order, HostQuestions& questions) {
  Ref<Object> drawn;
  questions.attempt([&] {
    drawn = _accessibilityFindAncestor(
        object, [&](Object& ancestor) { return order.contains(&ancestor); }, true);
  });
  return drawn ? order.at(drawn.get()) : 0;
}

bool isScrolledAway(Object& object, Point point, HostQuestions& questions) {
  const auto cutsOff = [&](Object& ancestor) {
    const ScrollView* scroll = cast<ScrollView>(&ancestor);
    return scroll != nullptr && !contains(*scroll, point);
  };
  bool isCutOff = false;
  questions.attempt([&] { isCutOff = _accessibilityFindAncestor(object, cutsOff, false) != nullptr; });
  return isCutOff;
}

}  // namespace

const Node* Snapshot::hitTest(Point point) const {
  HostQuestions questions;
  return hitTest(point, questions);
}

const Node* Snapshot::hitTest(Point point, HostQuestions& questions) const {
  const Ref<Object> screen = screen_.lock();
  const Ref<View> view(viewOf(screen));
  if (view) {
    if (View* answering = deepestAnsweringView(*view, point, questions, 0)) {
      const Ref<Object> answer = answerOf(*answering, point, questions);
      const Node* found = answer ? nodeOf(*answer) : nullptr;
      if (found != nullptr) return found;
    }
  }
  return frontMostElement(view, point, questions);
}

const Node* Snapshot::frontMostElement(const Ref<View>& view, Point point, HostQuestions& questions) const {
  DrawingOrder order;
  if (view) numberDrawn(*view, order, 0);
  const Node* frontMost = nullptr;
  std::size_t highest = 0;
  for (const Node& candidate : nodes_) {
    const Ref<Object> live = object(candidate.id);
    if (!candidate.isElement || !live || !candidate.frame.contains(point)) continue;
    if (isScrolledAway(*live, point, questions)) continue;
    const std::size_t height = depthInDrawing(*live, order, questions);
    if (frontMost != nullptr && height < highest) continue;
    frontMost = &candidate;
    highest = height;
  }
  return frontMost;
}

}  // namespace ax::reader
