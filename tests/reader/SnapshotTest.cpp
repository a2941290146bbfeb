#include <gtest/gtest.h>

#include <set>
#include <stdexcept>

#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

using Labels = std::vector<std::string>;

// Covers whatever lies behind it.
class Curtain : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Curtain>("SnapshotTestCurtain", View::staticClass())
                               .method<&Curtain::isModal>("accessibilityViewIsModal")
                               .build();
    return result;
  }
  bool isModal() { return true; }
};

// Raises at every question but the one whether it is an element.
class Broken : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Broken>("SnapshotTestBroken", View::staticClass())
                               .method<&Broken::raiseText>("accessibilityLabel")
                               .method<&Broken::raiseTraits>("accessibilityTraits")
                               .method<&Broken::raiseFrame>("accessibilityFrame")
                               .method<&Broken::raiseActivation>("accessibilityActivate")
                               .build();
    return result;
  }
  Ref<String> raiseText() { throw std::runtime_error("no label"); }
  Traits raiseTraits() { throw std::runtime_error("no traits"); }
  Rect raiseFrame() { throw std::runtime_error("no frame"); }
  bool raiseActivation() { throw std::runtime_error("no activation"); }

 protected:
  bool defaultIsElement() override { return true; }
};

// Makes a new list of a new element that is like itself at every question.
class Endless : public Responder {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Endless>("SnapshotTestEndless", Responder::staticClass())
                               .method<&Endless::elements>("accessibilityElements")
                               .build();
    return result;
  }
  Ref<Array> elements() { return array({make<Endless>()}); }
};

Ref<BarButtonItem> barItem(const std::string& title) {
  Ref<BarButtonItem> item = make<BarButtonItem>();
  item->setTitle(string(title));
  return item;
}

const Node& only(const Snapshot& snapshot) {
  EXPECT_EQ(snapshot.nodes().size(), 1u);
  return snapshot.nodes().front();
}

TEST(SnapshotTest, ReadsRowsInTheDirectionOfTheLanguage) {
  const Ref<View> screen = view(
      {label("below", {0, 50, 100, 20}), label("right", {200, 2, 100, 20}), label("left", {0, 0, 100, 20})});
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"left", "right", "below"}));

  setEnvironment({.locale = "ar_EG"});
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"right", "left", "below"}));
  setEnvironment({});
}

TEST(SnapshotTest, ReadsTheNavigationBarAroundTheTitleAndThenTheView) {
  const Ref<ViewController> screen = make<ViewController>();
  screen->setTitle(string("Friends"));
  screen->setView(view({label("content")}));
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"Friends", "content"}));

  screen->navigationItem()->setTitle(string("Sharing"));
  screen->navigationItem()->setLeftBarButtonItems(array({barItem("Back")}));
  screen->navigationItem()->setRightBarButtonItems(array({barItem("edge"), barItem("inner")}));
  const Snapshot snapshot = takeSnapshot(screen);
  EXPECT_EQ(labels(snapshot), (Labels{"Back", "Sharing", "inner", "edge", "content"}));
  EXPECT_EQ(snapshot.nodes()[1].role, Role::header);
  EXPECT_EQ(snapshot.nodes()[2].role, Role::button);
}

TEST(SnapshotTest, FollowsListedElementsAndVisitsEachOnce) {
  const Ref<View> screen = view({label("not listed")});
  const Ref<View> group = view({label("in the group")});
  const Ref<AccessibilityElement> bar = element("bar", screen);
  const Ref<View> loop = view({});
  messages::setAccessibilityElements(loop, array({screen, loop, bar}));
  messages::setAccessibilityElements(screen, array({string("no element"), bar, view({}), group, loop, bar}));
  EXPECT_EQ(labels(takeSnapshot(screen)), (Labels{"bar", "in the group"}));

  messages::setAccessibilityElements(screen, array({}));
  EXPECT_TRUE(takeSnapshot(screen).nodes().empty());
  messages::setAccessibilityElements(loop, nullptr);  // it held itself
}

TEST(SnapshotTest, EndsWhereTheHostDoesNot) {
  EXPECT_TRUE(takeSnapshot(make<Endless>()).nodes().empty());
  EXPECT_TRUE(takeSnapshot(nullptr).nodes().empty());
}

TEST(SnapshotTest, DoesNotEnterElements) {
  const Ref<View> cell = view({label("inside")});
  messages::setIsAccessibilityElement(cell, true);
  messages::setAccessibilityLabel(cell, string("cell"));
  EXPECT_EQ(labels(takeSnapshot(view({cell, label("after", {0, 900, 100, 20})}))), (Labels{"cell", "after"}));
  EXPECT_EQ(only(takeSnapshot(cell)).label->text, "cell");
}

TEST(SnapshotTest, LeavesOutWhatCannotBeSeen) {
  const Ref<Label> hidden = label("hidden");
  hidden->setHidden(true);
  const Ref<Label> badge = label("badge"), neighbour = label("neighbour");
  const Ref<View> faded = view({badge, neighbour});
  faded->setAlpha(0);
  const Ref<Layer> layer = make<Layer>();
  messages::setIsAccessibilityElement(layer, true);
  messages::setAccessibilityLabel(layer, string("layer"));
  const Ref<View> screen = view({hidden, faded});
  screen->layer()->addSublayer(layer);
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"layer"});

  _accessibilitySetViewIsVisible(badge, true);
  _accessibilitySetOverridesInvisibility(badge, true);
  layer->setOpacity(0);
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"badge"});
}

TEST(SnapshotTest, ShowsOnlyTheFrontMostModalView) {
  const Ref<ViewController> screen = make<ViewController>();
  screen->setTitle(string("Friends"));
  const Ref<View> front = view<Curtain>({label("loading")});
  screen->setView(view({label("behind"), view<Curtain>({label("covered")}), view({front}), label("beside")}));
  const Snapshot snapshot = takeSnapshot(screen);
  EXPECT_EQ(labels(snapshot), Labels{"loading"});
  EXPECT_TRUE(snapshot.nodes().front().states.modal);

  front->setHidden(true);
  EXPECT_EQ(labels(takeSnapshot(screen)), Labels{"covered"});
}

TEST(SnapshotTest, KeepsContainersThatSayWhatTheyAre) {
  const Ref<View> named = view({label("a"), label("b", {0, 40, 100, 20})});
  messages::setAccessibilityLabel(named, string("named"));
  const Ref<View> empty = view({view({})});
  messages::setAccessibilityLabel(empty, string("empty"));
  const Snapshot snapshot = takeSnapshot(view({empty, named}));
  ASSERT_EQ(snapshot.nodes().size(), 3u);
  const Node& container = snapshot.nodes()[0];
  EXPECT_EQ(container.role, Role::container);
  EXPECT_FALSE(container.isElement);
  EXPECT_EQ(container.children, (std::vector<NodeId>{snapshot.nodes()[1].id, snapshot.nodes()[2].id}));
  EXPECT_EQ(snapshot.nodes()[2].parent, container.id);
  EXPECT_EQ(snapshot.topNodes(), std::vector<NodeId>{container.id});
}

TEST(SnapshotTest, CopiesTextsWithTheirAttributes) {
  const Ref<AccessibilityAttributedString> text = make<AccessibilityAttributedString>("Pace 330, 12 km");
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {10, 2});
  text->setAttributeForKeyWithRange(number(true), DurationTimeMMSS, {5, 3});
  text->setAttributeForKeyWithRange(number(false), DurationTimeMMSS, {0, 4});
  const Ref<AccessibilityElement> spoken = element("x");
  messages::setAccessibilityValue(spoken, text);
  const Snapshot snapshot = takeSnapshot(spoken, [](const Object&) { return "pace"; });
  const Node& node = only(snapshot);
  EXPECT_EQ(node.objectId, "pace");
  ASSERT_EQ(node.value->attributes.size(), 2u);
  EXPECT_EQ(node.value->attributes[0].key, "DurationTimeMMSS");
  EXPECT_EQ(node.value->attributes[1].range, (TextRange{10, 2}));
}

TEST(SnapshotTest, AbsorbsAndCountsWhatTheHostRaises) {
  const Ref<View> broken = make<Broken>();
  const Snapshot snapshot = takeSnapshot(view({broken, label("whole")}));
  EXPECT_EQ(labels(snapshot), (Labels{"(nil)", "whole"}));
  EXPECT_EQ(snapshot.timesRaised(), 4u);  // one of them where the children are put in order
  EXPECT_EQ(snapshot.perform(Action::activate, snapshot.nodes()[0].id), ActionResult::raised);
}

TEST(SnapshotTest, NeverUsesAnIdTwice) {
  const Ref<View> screen = view({label("a"), label("b")});
  std::set<NodeId> ids;
  std::size_t nodes = 0;
  for (int i = 0; i < 3; ++i) {
    const Snapshot snapshot = takeSnapshot(screen);
    for (const Node& node : snapshot.nodes()) ids.insert(node.id);
    nodes += snapshot.nodes().size();
  }
  EXPECT_EQ(ids.size(), nodes);
  EXPECT_FALSE(ids.contains(0));
  EXPECT_EQ(takeSnapshot(screen).node(*ids.begin()), nullptr);
}

TEST(SnapshotActionsTest, ReachTheLiveObjectWhileItLives) {
  int activations = 0;
  Ref<Label> tappable = label("tap");
  _setAccessibilityActivateBlock(tappable, [&] { return ++activations < 2; });
  const Ref<View> screen = view({tappable, label("text", {0, 40, 100, 20})});
  const Snapshot snapshot = takeSnapshot(screen);
  const NodeId tap = snapshot.nodes()[0].id, text = snapshot.nodes()[1].id;
  EXPECT_EQ(snapshot.perform(Action::activate, tap), ActionResult::done);
  EXPECT_EQ(snapshot.perform(Action::activate, tap), ActionResult::notHandled);
  EXPECT_EQ(snapshot.perform(Action::increment, tap), ActionResult::unavailable);
  EXPECT_EQ(snapshot.perform(Action::activate, text), ActionResult::unavailable);

  tappable->removeFromSuperview();
  tappable = nullptr;
  EXPECT_EQ(snapshot.perform(Action::activate, tap), ActionResult::gone);
  EXPECT_EQ(snapshot.object(tap), nullptr);
  EXPECT_EQ(activations, 2);
}

TEST(SnapshotActionsTest, MovePagesAndRefuseWhatIsDisabled) {
  const Ref<PageControl> pages = make<PageControl>();
  pages->setNumberOfPages(3);
  Snapshot snapshot = takeSnapshot(pages);
  const std::string before = only(snapshot).value->text;
  EXPECT_EQ(snapshot.perform(Action::increment, only(snapshot).id), ActionResult::done);
  EXPECT_EQ(only(snapshot).value->text, before);  // as it was when it was asked
  EXPECT_NE(only(takeSnapshot(pages)).value->text, before);

  pages->setEnabled(false);
  snapshot = takeSnapshot(pages);
  EXPECT_TRUE(only(snapshot).states.disabled);
  EXPECT_EQ(snapshot.perform(Action::decrement, only(snapshot).id), ActionResult::unavailable);
  EXPECT_EQ(pages->currentPage(), 1);
}

}  // namespace

}  // namespace ax::reader::testing
