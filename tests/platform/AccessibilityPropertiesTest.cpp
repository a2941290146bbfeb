#include <gtest/gtest.h>

#include "platform/runtime/Number.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TableViewCell.h"
#include "platform/toolkit/ViewController.h"
#include "tests/contract/OwnProcess.h"
#include "tests/formatting/RegionScope.h"
#include "tests/platform/AddedCategory.h"

namespace ax {

namespace {

using namespace messages;

class Badge : public Label {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Badge>("PropertiesTest.Badge", Label::staticClass()).build();
    return result;
  }
};

class BadgeAccessibility : public SafeCategory {
 public:
  Ref<String> accessibilityLabel() { return string("badge " + super(messages::accessibilityLabel)->text()); }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitHeader; }
};
using B = BadgeAccessibility;
Class& badgeCategory() {
  return addCategory({"PropertiesTestBadgeAccessibility",
                      "PropertiesTest.Badge",
                      {overrides<&B::accessibilityLabel>(messages::accessibilityLabel),
                       overrides<&B::accessibilityTraits>(messages::accessibilityTraits)}});
}

class TextAccessibility : public SafeCategory {
 public:
  Ref<String> accessibilityLabel() { return string("override"); }
};
Class& textCategory() {
  return addCategory({"PropertiesTestTextAccessibility",
                      "String",
                      {overrides<&TextAccessibility::accessibilityLabel>(messages::accessibilityLabel)}});
}

TEST(AccessibilityPropertiesTest, AnswerInTheirOrderOfPrecedence) {
  const Ref<Badge> badge = make<Badge>();
  badge->setText(string("default"));
  EXPECT_EQ(accessibilityLabel(badge)->text(), "default");
  setAccessibilityLabel(badge, string("set"));
  EXPECT_EQ(accessibilityLabel(badge)->text(), "set");
  const Weak<Badge> weak = badge;
  _setAccessibilityLabelBlock(badge, [weak] { return string("block " + weak.get()->text()->text()); });
  EXPECT_EQ(accessibilityLabel(badge)->text(), "block default");
  badge->setText(string("changed"));
  EXPECT_EQ(accessibilityLabel(badge)->text(), "block changed") << "blocks are asked each time";
  graftCategory(badgeCategory(), Badge::staticClass());
  EXPECT_EQ(accessibilityLabel(badge)->text(), "badge block changed");
  EXPECT_EQ(accessibilityUserDefinedLabel(badge)->text(), "set");
  _accessibilityAddTrait(badge, TraitSelected);
  EXPECT_EQ(accessibilityTraits(badge), TraitStaticText | TraitHeader | TraitSelected);
  _setAccessibilityLabelBlock(badge, nullptr);
  setAccessibilityLabel(badge, nullptr);
  EXPECT_EQ(accessibilityLabel(badge)->text(), "badge changed") << "what is taken away uncovers the default";
}

TEST(AccessibilityPropertiesTest, HaveADefaultForEachClass) {
  const Ref<Label> label = make<Label>();
  EXPECT_FALSE(isAccessibilityElement(label));
  label->setText(string(""));
  EXPECT_FALSE(isAccessibilityElement(label));
  label->setText(string("text"));
  EXPECT_TRUE(isAccessibilityElement(label));
  const Ref<Button> button = make<Button>();
  EXPECT_FALSE(isAccessibilityElement(button));
  button->setTitle(string("Go"));
  EXPECT_TRUE(isAccessibilityElement(button));
  EXPECT_EQ(accessibilityLabel(button)->text(), "Go");
  button->setEnabled(false);
  EXPECT_EQ(accessibilityTraits(button), TraitButton | TraitNotEnabled);
  const Ref<ImageView> image = make<ImageView>();
  image->setImage(make<Image>());
  setAccessibilityLabel(image->image(), string("sun"));
  EXPECT_EQ(accessibilityLabel(image)->text(), "sun");
  EXPECT_FALSE(isAccessibilityElement(image));
  EXPECT_TRUE(isAccessibilityElement(make<Control>()));
  EXPECT_TRUE(isAccessibilityElement(make<AccessibilityElement>()));
  EXPECT_FALSE(isAccessibilityElement(make<TableViewCell>()));
  EXPECT_FALSE(isAccessibilityElement(make<Layer>()));
  setIsAccessibilityElement(image, true);
  EXPECT_TRUE(isAccessibilityElement(image));
  _setIsAccessibilityElementBlock(image, [] { return false; });
  EXPECT_FALSE(isAccessibilityElement(image));
}

TEST(AccessibilityPropertiesTest, SpeakTheSpokenFormOfATextFirst) {
  const Ref<Label> label = make<Label>();
  label->setText(string("5 km"));
  setAccessibilityLabel(label->text(), string("5 kilometers"));
  EXPECT_EQ(accessibilityLabel(label)->text(), "5 kilometers");
  const Ref<AttributedString> styled = make<AttributedString>(string("6 km"));
  label->setAttributedText(styled);
  EXPECT_EQ(accessibilityLabel(label)->text(), "6 km");
  setAccessibilityLabel(styled, string("6 kilometers"));
  EXPECT_EQ(accessibilityLabel(label)->text(), "6 kilometers");
  label->setAttributedText(nullptr);
  EXPECT_EQ(accessibilityLabel(label), nullptr);
  label->setText(string("plain"));
  EXPECT_EQ(accessibilityLabel(label), label->text());
}

TEST(AccessibilityPropertiesTest, AskTheTextsOverride) {
  if (ranInOwnProcess()) return;
  const Ref<Label> label = make<Label>();
  label->setText(string("plain"));
  graftCategory(textCategory(), String::staticClass());
  EXPECT_EQ(accessibilityLabel(label)->text(), "override") << "also of a text that carries nothing";
}

TEST(AccessibilityPropertiesTest, LetABlockReplaceItselfWhileItRuns) {
  const Ref<View> view = make<View>();
  View* raw = view.get();
  const std::string kept(64, 'x');
  _setAccessibilityActivateBlock(view, [raw, kept] {
    _setAccessibilityActivateBlock(raw, [] { return false; });
    return kept.size() == 64;
  });
  EXPECT_TRUE(accessibilityActivate(view));
  EXPECT_FALSE(accessibilityActivate(view));
  _setAccessibilityValueBlock(nullptr, [] { return string(""); });
  _accessibilityAddTrait(nullptr, TraitButton);
}

TEST(AccessibilityPropertiesTest, DoNotKeepTheContainer) {
  Ref<View> container = make<View>();
  const Weak<View> weak = container;
  const Ref<AccessibilityElement> element = AccessibilityElement::initWithAccessibilityContainer(container);
  container->_accessibilitySetRetainedValueForKey(element, "kAXPropertiesTest"_key);
  EXPECT_EQ(accessibilityContainer(element), container);
  container = nullptr;
  EXPECT_FALSE(weak) << "an element that its container stores must not keep it";
  EXPECT_EQ(accessibilityContainer(element), nullptr);
}

class Receiving : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Receiving>("PropertiesTest.Receiving", Object::staticClass())
                               .method<&Receiving::tapped>("tapped:")
                               .build();
    return result;
  }
  void tapped(Ref<Object> sender) { last = sender; }
  Ref<Object> last;
};

TEST(ControlTest, TellsItsTarget) {
  Ref<Receiving> target = make<Receiving>();
  const Ref<Button> button = make<Button>();
  EXPECT_FALSE(button->sendAction());
  button->setTargetAction(target, "tapped:"_key);
  EXPECT_TRUE(accessibilityActivate(button));
  EXPECT_EQ(target->last, button);
  target->last = nullptr;
  button->setEnabled(false);
  EXPECT_FALSE(accessibilityActivate(button));
  EXPECT_EQ(target->last, nullptr);
  button->setEnabled(true);
  button->setAction("nobodyAnswersThis:"_key);
  EXPECT_FALSE(button->sendAction());
  target = nullptr;
  button->setAction("tapped:"_key);
  EXPECT_FALSE(button->sendAction());
  EXPECT_EQ(button->target(), nullptr);
}

TEST(PageControlPagesTest, StaysWithinItsPages) {
  const RegionScope scope("en_US");
  const Ref<PageControl> pages = make<PageControl>();
  EXPECT_EQ(pages->currentPage(), 0);
  pages->setCurrentPage(3);
  EXPECT_EQ(pages->currentPage(), 0);
  pages->setNumberOfPages(3);
  accessibilityDecrement(pages);
  EXPECT_EQ(pages->currentPage(), 0);
  for (int i = 0; i < 5; ++i) accessibilityIncrement(pages);
  EXPECT_EQ(pages->currentPage(), 2);
  ASSERT_NE(accessibilityValue(pages), nullptr);
  EXPECT_NE(accessibilityValue(pages)->text().find('3'), std::string::npos);
  EXPECT_EQ(accessibilityTraits(pages), TraitAdjustable);
  pages->setNumberOfPages(-1);
  EXPECT_EQ(pages->numberOfPages(), 0);
  EXPECT_EQ(pages->currentPage(), 0);
}

TEST(TableViewCellTest, ShowsItsPartsInItsContent) {
  const Ref<TableViewCell> cell = make<TableViewCell>();
  const Ref<Label> text = make<Label>();
  const Ref<Label> elsewhere = make<Label>();
  const Ref<View> other = make<View>();
  other->addSubview(elsewhere);
  cell->setTextLabel(text);
  cell->setDetailTextLabel(elsewhere);
  EXPECT_EQ(text->superview(), cell->contentView().get());
  EXPECT_EQ(elsewhere->superview(), other.get()) << "a label that stands somewhere stays there";
  EXPECT_EQ(cell->subviews().size(), 1u);
  EXPECT_EQ(cell->safeValueForKey("textLabel"_key), text);
  EXPECT_EQ(cell->safeValueForKey("imageView"_key), nullptr);
}

TEST(ViewTest, HasOneSuperviewAndNoCircle) {
  const Ref<View> first = make<View>();
  const Ref<View> second = make<View>();
  Ref<View> child = make<View>();
  first->addSubview(child);
  second->addSubview(child);
  EXPECT_TRUE(first->subviews().empty());
  EXPECT_EQ(child->superview(), second.get());
  child->addSubview(second);
  child->addSubview(child);
  EXPECT_TRUE(child->subviews().empty());
  Weak<View> weak = child;
  child->removeFromSuperview();
  child = nullptr;
  EXPECT_FALSE(weak);
}

TEST(LayerTest, HasOneSuperlayerAndNoCircle) {
  const Ref<Layer> first = make<Layer>();
  const Ref<Layer> second = make<Layer>();
  first->addSublayer(make<Layer>());
  second->addSublayer(first->sublayers().front());
  EXPECT_TRUE(first->sublayers().empty());
  ASSERT_EQ(second->sublayers().size(), 1U);
  second->sublayers().front()->addSublayer(second);
  EXPECT_EQ(second->superlayer(), nullptr);
}

TEST(NavigationItemTest, CountsFromTheRight) {
  const Ref<NavigationItem> item = make<ViewController>()->navigationItem();
  EXPECT_EQ(item->rightBarButtonItem(), nullptr);
  const Ref<BarButtonItem> share = make<BarButtonItem>();
  item->setRightBarButtonItems(array({share, make<BarButtonItem>()}));
  EXPECT_EQ(item->rightBarButtonItem(), share);
  item->setRightBarButtonItem(nullptr);
  EXPECT_TRUE(item->rightBarButtonItems()->isEmpty());
}

}  // namespace

}  // namespace ax
