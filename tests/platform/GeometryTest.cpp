#include <gtest/gtest.h>

#include <cmath>

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/SpokenText.h"
#include "platform/toolkit/TreeDepth.h"
#include "tests/formatting/RegionScope.h"

namespace ax {

namespace {

using namespace messages;

template <class T>
Ref<T> at(Rect frame, const Ref<View>& superview = nullptr) {
  Ref<T> view = make<T>();
  view->setFrame(frame);
  if (superview) superview->addSubview(view);
  return view;
}

TEST(GeometryTest, ConvertsThroughScrolledContent) {
  const Ref<View> window = at<View>({10, 20, 400, 800});
  const Ref<ScrollView> scroll = at<ScrollView>({5, 5, 300, 300}, window);
  const Ref<View> row = at<View>({0, 500, 300, 50}, scroll);
  EXPECT_EQ(accessibilityFrame(row), (Rect{15, 525, 300, 50}));
  scroll->setContentOffset({2, 490});
  EXPECT_EQ(accessibilityFrame(row), (Rect{13, 35, 300, 50}));
  EXPECT_EQ(accessibilityFrame(scroll), (Rect{15, 25, 300, 300})) << "what scrolls does not move itself";
  EXPECT_EQ(scroll->bounds(), (Rect{2, 490, 300, 300}));
  EXPECT_EQ(convertFrameToScreenCoordinates({1, 1, 2, 2}, row), (Rect{14, 36, 2, 2}));
  EXPECT_EQ(convertFrameToScreenCoordinates({1, 1, 2, 2}, nullptr), (Rect{1, 1, 2, 2}));
  EXPECT_EQ(accessibilityActivationPoint(row), (Point{163, 60}));
  setAccessibilityFrame(row, {1, 2, 3, 4});
  EXPECT_EQ(accessibilityFrame(row), (Rect{1, 2, 3, 4}));
}

TEST(GeometryTest, ConvertsThroughLayers) {
  const Ref<View> view = at<View>({100, 100, 50, 50});
  const Ref<Layer> week = make<Layer>();
  const Ref<Layer> day = make<Layer>();
  week->setFrame({0, 10, 50, 10});
  day->setFrame({7, 1, 5, 5});
  view->layer()->addSublayer(week);
  week->addSublayer(day);
  EXPECT_EQ(accessibilityFrame(day), (Rect{107, 111, 5, 5}));
  EXPECT_EQ(accessibilityFrame(view->layer()), (Rect{100, 100, 0, 0}));
  EXPECT_EQ(_accessibilityAncestorIsKindOf(day, &View::staticClass()), view);
}

TEST(GeometryTest, ConvertsElementsAtEachQuery) {
  const Ref<ScrollView> scroll = at<ScrollView>({10, 10, 100, 100});
  const Ref<AccessibilityElement> bar = AccessibilityElement::initWithAccessibilityContainer(scroll);
  bar->setAccessibilityFrameInContainerSpace({0, 50, 10, 10});
  const Ref<AccessibilityElement> part = AccessibilityElement::initWithAccessibilityContainer(bar);
  part->setAccessibilityFrameInContainerSpace({1, 2, 3, 4});
  EXPECT_EQ(accessibilityFrame(bar), (Rect{10, 60, 10, 10}));
  scroll->setContentOffset({0, 50});
  EXPECT_EQ(accessibilityFrame(bar), (Rect{10, 10, 10, 10}));
  EXPECT_EQ(accessibilityFrame(part), (Rect{1, 2, 3, 4})) << "an element has no space of its own";
  setAccessibilityFrame(bar, {1, 1, 1, 1});
  EXPECT_EQ(accessibilityFrame(bar), (Rect{1, 1, 1, 1})) << "the frame that was set last counts";
  bar->setAccessibilityFrameInContainerSpace({0, 0, 2, 2});
  EXPECT_EQ(accessibilityFrame(bar), (Rect{10, -40, 2, 2}));
}

TEST(GeometryTest, UnitesElements) {
  const Ref<View> left = at<View>({10, 10, 10, 10});
  const Ref<View> right = at<View>({50, 0, 5, 5});
  EXPECT_EQ(frameForElements(array({left, right})), (Rect{10, 0, 45, 20}));
  EXPECT_EQ(frameForElements(array({right})), (Rect{50, 0, 5, 5}));
  EXPECT_EQ(frameForElements(nullptr), Rect());
  const auto both =
      AggregateElement::initWithAccessibilityContainerRepresentedElements(nullptr, array({left, right}));
  EXPECT_EQ(accessibilityFrame(both), (Rect{10, 0, 45, 20}));
  right->setFrame({50, 0, 50, 5});
  EXPECT_EQ(accessibilityFrame(both).width, 90);
}

std::vector<int> order(const Array& sorted, const Array& all) {
  std::vector<int> result;
  for (const Ref<Object>& element : sorted) {
    result.push_back(static_cast<int>(std::find(all.begin(), all.end(), element) - all.begin()));
  }
  return result;
}

TEST(ReadingOrderTest, GoesByRowsThenInTheDirectionOfTheLanguage) {
  // Two rows that are not quite straight, and one below them; what overlaps by half stands in one row.
  const Ref<Array> all =
      array({at<View>({100, 4, 50, 20}), at<View>({0, 30, 200, 20}), at<View>({0, 0, 50, 20}),
             at<View>({100, 28, 50, 20}), at<View>({0, 60, 10, 10})});
  EXPECT_EQ(order(*sortedByGeometry(*all), *all), (std::vector{2, 0, 1, 3, 4}));
  EXPECT_LT(accessibilityCompareGeometry(*all->at(2), *all->at(0)), 0);
  EXPECT_GT(accessibilityCompareGeometry(*all->at(4), *all->at(0)), 0);
  EXPECT_EQ(accessibilityCompareGeometry(*all->at(1), *all->at(1)), 0);
  const RegionScope scope("ar_EG");
  EXPECT_EQ(order(*sortedByGeometry(*all), *all), (std::vector{0, 2, 1, 3, 4}));
  EXPECT_GT(accessibilityCompareGeometry(*all->at(2), *all->at(0)), 0);
}

TEST(ReadingOrderTest, StandsStrangeFrames) {
  const double nan = std::nan("");
  const Ref<Array> all = array({at<View>({nan, nan, nan, nan}), at<View>({5, 0, 0, 0}),
                                at<View>({5, 0, 0, 0}), at<View>({0, 0, 0, 0}), at<View>({0, nan, 10, 10})});
  EXPECT_EQ(sortedByGeometry(*all)->count(), 5u);
  const Ref<Array> equal = array({all->at(1), all->at(2), all->at(3)});
  EXPECT_EQ(order(*sortedByGeometry(*equal), *equal), (std::vector{2, 0, 1}))
      << "the same place keeps its order";
}

TEST(VisibilityTest, FollowsTheAncestors) {
  const Ref<View> window = at<View>({});
  const Ref<View> panel = at<View>({}, window);
  const Ref<Label> label = at<Label>({}, panel);
  const Ref<AccessibilityElement> element = AccessibilityElement::initWithAccessibilityContainer(panel);
  EXPECT_TRUE(_accessibilityViewIsVisible(label));
  panel->setAlpha(0);
  EXPECT_FALSE(_accessibilityViewIsVisible(label));
  EXPECT_FALSE(_accessibilityViewIsVisible(element));
  EXPECT_TRUE(_accessibilityViewIsVisible(window));
  _accessibilitySetViewIsVisible(panel, true);
  EXPECT_FALSE(_accessibilityViewIsVisible(panel)) << "it takes both marks";
  _accessibilitySetOverridesInvisibility(panel, true);
  EXPECT_TRUE(_accessibilityViewIsVisible(panel));
  EXPECT_TRUE(_accessibilityViewIsVisible(label)) << "what stands in it is seen with it";
  label->setHidden(true);
  EXPECT_FALSE(_accessibilityViewIsVisible(label));
  EXPECT_FALSE(_accessibilityViewIsVisible(nullptr));
}

TEST(ElementTreeTest, FindsRelatives) {
  const Ref<View> window = at<View>({});
  const Ref<ScrollView> scroll = at<ScrollView>({}, window);
  const Ref<Label> label = at<Label>({}, scroll);
  const Ref<AccessibilityElement> element = AccessibilityElement::initWithAccessibilityContainer(label);
  EXPECT_EQ(_accessibilityAncestorIsKindOf(element, &ScrollView::staticClass()), scroll);
  EXPECT_EQ(_accessibilityAncestorIsKindOf(scroll, &ScrollView::staticClass()), nullptr);
  EXPECT_EQ(_accessibilityAncestorIsKindOf(label, safeClassFromString("GeometryTest.Missing")), nullptr);
  const ElementTest any = [](Object&) { return true; };
  EXPECT_EQ(_accessibilityFindAncestor(label, any, true), label);
  EXPECT_EQ(_accessibilityFindAncestor(label, any, false), scroll);
  EXPECT_EQ(_accessibilityFindAncestor(window, any, false), nullptr);
  setAccessibilityElements(label, array({element}));
  const ElementTest isElement = [](Object& object) { return isAccessibilityElement(object); };
  EXPECT_TRUE(
      _accessibilityFindUnsortedDescendantsPassingTest(window, isElement)->isEqual(*array({element})));
  EXPECT_EQ(_accessibilityFindSubviewDescendantsPassingTest(window, any)->count(), 2u);
  EXPECT_TRUE(_accessibilityFindSubviewDescendantsPassingTest(nullptr, any)->isEmpty());
}

// Lists a new one of itself, and lies in a new one, whenever it is asked.
class Endless : public View {
 public:
  static inline std::size_t madeAtOnce = 1;

  static Class& staticClass() {
    static Class& result = ClassBuilder<Endless>("GeometryTest.Endless", View::staticClass())
                               .method<&Endless::elements>("accessibilityElements")
                               .method<&Endless::container>("accessibilityContainer")
                               .build();
    return result;
  }
  Ref<Array> elements() {
    Array::Items made;
    for (std::size_t i = 0; i < madeAtOnce; ++i) made.push_back(make<Endless>());
    return array(std::move(made));
  }
  Ref<Object> container() { return kept_ = make<Endless>(); }

 private:
  Ref<Object> kept_;
};

TEST(ElementTreeTest, EndsWhereTheHostDoesNot) {
  const auto all = [](Object&) { return true; };
  const auto none = [](Object&) { return false; };
  const Ref<Endless> endless = make<Endless>();
  std::size_t before = timesTooDeep();
  EXPECT_EQ(_accessibilityFindUnsortedDescendantsPassingTest(endless, all)->count(), deepestLevel);
  EXPECT_EQ(timesTooDeep(), before + 1);
  EXPECT_EQ(_accessibilityFindAncestor(endless, none, true), nullptr);
  EXPECT_EQ(timesTooDeep(), before + 2);

  Endless::madeAtOnce = 2;
  EXPECT_EQ(_accessibilityFindUnsortedDescendantsPassingTest(endless, all)->count(), mostObjects);

  const Ref<View> root = make<View>();
  Ref<View> deep = root;
  for (int i = 0; i < 1000; ++i) deep = at<View>({1, 0, 10, 10}, deep);
  setAccessibilityLabel(deep, string("deep"));
  before = timesTooDeep();
  EXPECT_EQ(_accessibilityFindSubviewDescendantsPassingTest(root, all)->count(), deepestLevel);
  EXPECT_EQ(
      _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(root, true, true, nullptr)
          ->text(),
      "");
  EXPECT_GE(timesTooDeep(), before + 2);
  EXPECT_EQ(convertFrameToScreenCoordinates({}, deep).x, 1000) << "a place is worked out whole";
}

}  // namespace

}  // namespace ax
