#include <gtest/gtest.h>

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/ScrollView.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

// Knows which of its elements lies under a point: the left or the right one.
class Halves : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Halves>("HitTestTestHalves", View::staticClass())
                               .method<&Halves::elementAt>("_accessibilityHitTest:withEvent:")
                               .build();
    return result;
  }
  Ref<Object> elementAt(Point point, Ref<Object>) {
    const Ref<Array> elements = messages::accessibilityElements(*this);
    return point.y > 30 ? nullptr : elements->at(point.x < bounds().width / 2 ? 0 : 1);
  }
};

std::string labelAt(const Ref<View>& screen, Point point) {
  const Snapshot snapshot = takeSnapshot(screen);
  const Node* found = snapshot.hitTest(point);
  return found == nullptr ? "nothing" : found->label->text;
}

TEST(HitTest, AsksTheDeepestViewThatAnswersItselfInItsOwnSpace) {
  const Ref<Halves> halves = view<Halves>({}, {100, 200, 80, 40});
  messages::setAccessibilityElements(halves, array({element("left", halves), element("right", halves)}));
  const Ref<View> screen = view({halves});
  EXPECT_EQ(labelAt(screen, {139, 201}), "left");
  EXPECT_EQ(labelAt(screen, {141, 201}), "right");
  EXPECT_EQ(labelAt(screen, {141, 235}), "nothing");
  EXPECT_EQ(labelAt(screen, {99, 201}), "nothing");
}

TEST(HitTest, ElseFindsTheFrontMostFrame) {
  const Ref<View> screen = view({label("under", {0, 0, 100, 100}), label("over", {50, 50, 100, 100})});
  EXPECT_EQ(labelAt(screen, {60, 60}), "over");
  EXPECT_EQ(labelAt(screen, {10, 10}), "under");
  EXPECT_EQ(labelAt(screen, {150, 150}), "nothing");  // frames end before their far edge

  // Read last, and yet drawn behind.
  const Ref<View> reversed = view({label("back", {40, 90, 100, 100}), label("front", {50, 50, 100, 100})});
  EXPECT_EQ(labelAt(reversed, {60, 95}), "front");
}

TEST(HitTest, FindsAnElementOfAViewAboveTheViewsBehind) {
  const Ref<View> chart = view({}, {0, 0, 100, 100});
  const Ref<AccessibilityElement> bar = element("bar", chart);
  bar->setAccessibilityFrameInContainerSpace({10, 10, 20, 20});
  messages::setAccessibilityElements(chart, array({bar}));
  const Ref<View> screen = view({label("behind", {0, 0, 100, 100}), chart});
  EXPECT_EQ(labelAt(screen, {15, 15}), "bar");
  EXPECT_EQ(labelAt(screen, {5, 5}), "behind");
}

TEST(HitTest, DoesNotFindWhatIsScrolledAwayOrGone) {
  Ref<Label> top = label("top", {0, 0, 100, 40});
  const Ref<ScrollView> scroll = view<ScrollView>({top, label("next", {0, 40, 100, 40})}, {0, 100, 100, 40});
  const Ref<View> screen = view({label("above", {0, 60, 100, 40}), scroll});
  EXPECT_EQ(labelAt(screen, {5, 110}), "top");
  scroll->setContentOffset({0, 40});
  EXPECT_EQ(labelAt(screen, {5, 110}), "next");
  EXPECT_EQ(labelAt(screen, {5, 70}), "above");

  const Snapshot snapshot = takeSnapshot(top);
  top->removeFromSuperview();
  top = nullptr;
  EXPECT_EQ(snapshot.hitTest({5, 5}), nullptr);
}

}  // namespace

}  // namespace ax::reader::testing
