#include "platform/toolkit/SpokenText.h"

#include <gtest/gtest.h>

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"
#include "tests/formatting/RegionScope.h"

namespace ax {

namespace {

using namespace messages;
const Ref<String>& end = stringForVariablesSentinel;

Ref<Label> label(const char* text, const Ref<View>& superview = nullptr) {
  Ref<Label> made = make<Label>();
  made->setText(string(text));
  if (superview) superview->addSubview(made);
  return made;
}

TEST(StringForVariablesTest, DropsWhatIsMissingWithItsSeparator) {
  const RegionScope scope("en_US");
  EXPECT_EQ(stringForVariables({string("one"), nullptr, string(""), string("two"), end})->text(), "one, two");
  EXPECT_EQ(stringForVariables({nullptr, string(""), end})->text(), "");
  EXPECT_EQ(stringForVariables({end})->text(), "");
  EXPECT_EQ(stringForVariables({string("one"), end, string("after")})->text(), "one");
  EXPECT_EQ(stringForVariables({string("a"), string("__AXStringForVariablesSentinel")})->text(), "a");
  const RegionScope arabic("ar_EG");
  EXPECT_EQ(stringForVariables({string("a"), string("b"), end})->text(), "a، b");
  const RegionScope japanese("ja_JP");
  EXPECT_EQ(stringForVariables({string("a"), string("b"), end})->text(), "a、b");
}

TEST(StringForVariablesTest, KeepsAttributesInTheirPlace) {
  const RegionScope scope("en_US");
  const auto duration = AccessibilityAttributedString::initWithString(string("12:34"));
  duration->setAttributeForKeyWithRange(number(true), DurationTimeMMSS, {0, 2});
  duration->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {3, 2});
  const Ref<String> joined = stringForVariables({string("Zeit è"), duration, string("last"), duration, end});
  const auto spoken = cast<AccessibilityAttributedString>(joined);
  ASSERT_TRUE(spoken);
  EXPECT_EQ(spoken->text(), "Zeit è, 12:34, last, 12:34");
  ASSERT_EQ(spoken->attributes().size(), 4u);
  EXPECT_EQ(spoken->text().substr(spoken->attributes()[0].range.location, 2), "12");
  EXPECT_EQ(spoken->text().substr(spoken->attributes()[3].range.location, 2), "34");
  EXPECT_EQ(spoken->attributes()[3].range.location, 25u);
  EXPECT_EQ(spoken->attributes()[1].key, DurationTimeHHMMSS);
  const Ref<String> alone = stringForVariables({nullptr, duration, end});
  EXPECT_EQ(cast<AccessibilityAttributedString>(alone)->attributes().size(), 2u);
  EXPECT_EQ(cast<AccessibilityAttributedString>(stringForVariables({string("a"), string("b"), end})),
            nullptr);
}

TEST(LabelForElementsTest, SpeaksLabelsAndTexts) {
  const RegionScope scope("en_US");
  const Ref<View> silent = make<View>();
  const Ref<String> abbreviated = string("km");
  setAccessibilityLabel(abbreviated, string("kilometers"));
  EXPECT_EQ(labelForElements(array({label("one"), silent, string("two"), abbreviated}))->text(),
            "one, two, kilometers");
  EXPECT_EQ(labelForElements({label("one"), nullptr, label("two")})->text(), "one, two");
  EXPECT_EQ(labelForElements(Ref<Array>())->text(), "");
}

class Pair : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Pair>("SpokenTextTest.Pair", View::staticClass())
                               .instanceVariable<&Pair::score>("_scoreView")
                               .instanceVariable<&Pair::days>("_daysRemainingLabel")
                               .build();
    return result;
  }
  Ref<View> score = make<View>();
  Ref<Label> days = label("3 days");
};

TEST(LabelKeyValuesTest, SpeaksTheMembersInOrder) {
  const RegionScope scope("en_US");
  const Ref<Pair> pair = make<Pair>();
  const auto text = [&](const char* keys) {
    return _accessibilityStringForLabelKeyValues(pair, keys)->text();
  };
  EXPECT_EQ(text("_scoreView, _daysRemainingLabel"), "3 days");
  setAccessibilityLabel(pair->score, string("1 to 0"));
  EXPECT_EQ(text("_scoreView, _daysRemainingLabel"), "1 to 0, 3 days");
  EXPECT_EQ(text("_daysRemainingLabel, _SpokenTextTestMissing, _scoreView"), "3 days, 1 to 0");
  EXPECT_EQ(text(""), "");
  EXPECT_EQ(_accessibilityStringForLabelKeyValues(nullptr, "_scoreView")->text(), "");
}

// A panel with a header that holds a label, a button, a view that has a label without being an element, a
// hidden label, and a layer.
Ref<View> panel() {
  const Ref<View> all = make<View>();
  setAccessibilityLabel(all, string("panel"));
  const Ref<Label> header = label("header", all);
  _accessibilityAddTrait(header, TraitHeader);
  label("in header", header);
  const Ref<View> group = make<View>();
  all->addSubview(group);
  const Ref<Button> button = make<Button>();
  button->setTitle(string("button"));
  group->addSubview(button);
  const Ref<View> note = make<View>();
  setAccessibilityLabel(note, string("note"));
  label("in note", note);
  group->addSubview(note);
  label("hidden", group)->setHidden(true);
  const Ref<Layer> ring = make<Layer>();
  setAccessibilityLabel(ring, string("ring"));
  group->layer()->addSublayer(ring);
  return all;
}

TEST(SubhierarchyTextTest, ChoosesHeadersAndFocusableItems) {
  const RegionScope scope("en_US");
  const Ref<View> all = panel();
  const auto text = [&](bool headers, bool focusable, const Ref<Array>& exclusions = nullptr) {
    return _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(all, headers, focusable,
                                                                                     exclusions)
        ->text();
  };
  EXPECT_EQ(text(true, true), "header, button, note, ring");
  EXPECT_EQ(text(true, false), "header, note, ring");
  EXPECT_EQ(text(false, true), "button, note, ring");
  EXPECT_EQ(text(false, false), "note, ring");
  EXPECT_EQ(text(true, true, array({all->subviews()[1]})), "header");
}

TEST(StringForAllChildrenTest, SpeaksElementsBelow) {
  const RegionScope scope("en_US");
  const Ref<View> all = panel();
  EXPECT_EQ(stringForAllChildren(all)->text(), "header, button, in note");
  const Ref<AccessibilityElement> bar = AccessibilityElement::initWithAccessibilityContainer(all);
  setAccessibilityLabel(bar, string("bar"));
  setAccessibilityElements(all->subviews()[1], array({bar}));
  EXPECT_EQ(stringForAllChildren(all)->text(), "header, bar") << "a list takes the place of the subviews";
  EXPECT_EQ(stringForAllChildren(nullptr)->text(), "");
}

}  // namespace

}  // namespace ax
