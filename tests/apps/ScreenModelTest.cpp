#include "apps/view/model/ScreenModel.h"

#include <gtest/gtest.h>

#include <stdexcept>

#include "apps/view/model/ChartTour.h"
#include "apps/view/model/Operating.h"
#include "platform/accessibility/Notifications.h"
#include "platform/runtime/ClassBuilder.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::view {

namespace pieces = reader::testing;
using pieces::element, pieces::label;

namespace {

using Names = std::vector<std::string>;

// Does what the test says when it is activated.
class Lever : public Button {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Lever>("ScreenModelTestLever", Button::staticClass())
                               .method<&Lever::pull>("accessibilityActivate")
                               .build();
    return result;
  }
  bool pull() {
    work();
    return true;
  }
  std::function<void()> work;
};

// Covers the rest, and knows how to go away when it has learnt it.
class Cover : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Cover>("ScreenModelTestCover", View::staticClass())
                               .method<&Cover::isModal>("accessibilityViewIsModal")
                               .method<&Cover::escape>("accessibilityPerformEscape")
                               .build();
    return result;
  }
  bool isModal() { return true; }
  bool escape() {
    escapes += 1;
    if (knowsHow) removeFromSuperview();
    return knowsHow;
  }
  bool knowsHow = false;
  int escapes = 0;
};

// Makes its elements anew at every question.
class Forgetful : public View {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Forgetful>("ScreenModelTestForgetful", View::staticClass())
                               .method<&Forgetful::elements>("accessibilityElements")
                               .build();
    return result;
  }
  Ref<Array> elements() {
    Array::Items items;
    for (const std::string& name : names) items.push_back(element(name, this));
    return array(std::move(items));
  }
  Names names;
};

class ScreenModelTest : public testing::Test, public ScreenListener {
 protected:
  ScreenModelTest() { model.setListener(this); }

  void itemsAboutToGo(const std::vector<ItemId>& items) override {
    for (const ItemId id : items) gone.push_back(model.find(id)->name);
  }
  ItemId named(const std::string& name) const {
    for (const ItemId id : model.readingOrder()) {
      if (model.find(id)->name == name) return id;
    }
    return 0;
  }
  Names namesOf(const std::vector<ItemId>& ids) const {
    Names names;
    for (const ItemId id : ids) names.push_back(model.find(id)->name);
    return names;
  }
  std::string focused() const { return model.find(model.focus())->name; }

  const Ref<Label> one = label("one", {0, 0, 90, 20}), two = label("two", {0, 40, 90, 20}),
                   three = label("three", {0, 80, 90, 20});
  const Ref<View> screen = pieces::view({one, two, three});
  ScreenModel model{[this] { return reader::takeSnapshot(screen); }};
  Names gone;
};

}  // namespace

TEST_F(ScreenModelTest, TellsOnlyWhatChangedAndKeepsTheRest) {
  const ItemId first = named("one"), last = named("three");
  EXPECT_FALSE(model.refresh().isAny());
  one->setText(string("uno"));
  two->removeFromSuperview();
  screen->addSubview(label("four", {0, 120, 90, 20}));
  const ScreenChange change = model.refresh();
  EXPECT_EQ(gone, Names{"two"});
  EXPECT_EQ(namesOf(change.added), Names{"four"});
  ASSERT_EQ(change.changed.size(), 1u);
  EXPECT_EQ(change.changed[0].item, first);
  EXPECT_TRUE(change.changed[0].name && !change.changed[0].frame && !change.changed[0].hint);
  EXPECT_EQ(model.find(last)->place, 1u);
  EXPECT_EQ(namesOf(model.readingOrder()), (Names{"uno", "three", "four"}));
}

TEST_F(ScreenModelTest, FocusStaysOnItsObjectOrGoesToWhatIsReadThere) {
  model.setFocus(named("two"));
  one->removeFromSuperview();
  EXPECT_FALSE(model.refresh().isElsewhere);
  EXPECT_EQ(focused(), "two");
  two->setFrame({0, 200, 90, 20});  // behind three: another item, the same object
  EXPECT_TRUE(model.refresh().isElsewhere);
  EXPECT_EQ(focused(), "two");
  two->setHidden(true);
  model.refresh();
  EXPECT_EQ(focused(), "three");
  three->setHidden(true);
  model.refresh();
  EXPECT_EQ(model.focus(), 0u);
  three->setHidden(false);
  EXPECT_TRUE(model.refresh().isElsewhere);
  EXPECT_EQ(focused(), "three");
}

TEST_F(ScreenModelTest, ElementsMadeAnewStayWhereTheyAreAlike) {
  const Ref<Forgetful> list = pieces::view<Forgetful>({}, {0, 120, 400, 400});
  list->names = {"a", "b", "b", "c"};
  screen->addSubview(list);
  model.refresh();
  const ItemId secondB = model.readingOrder()[5], last = named("c");
  list->names = {"a", "b", "b", "x", "c"};
  EXPECT_EQ(namesOf(model.refresh().added), Names{"x"});
  EXPECT_EQ(model.readingOrder()[5], secondB);
  EXPECT_EQ(named("c"), last);
  EXPECT_TRUE(gone.empty());
}

TEST_F(ScreenModelTest, NeighboursEndAtBothEnds) {
  const auto any = [](const Item&) { return true; };
  EXPECT_EQ(model.neighbour(named("one"), -1, any), 0u);
  EXPECT_EQ(model.neighbour(named("three"), 1, any), 0u);
  EXPECT_EQ(model.neighbour(named("three"), -1, [](const Item& item) { return item.name == "one"; }),
            named("one"));
  EXPECT_EQ(model.neighbour(0, 1, any), 0u);
}

TEST_F(ScreenModelTest, NamesCarryWhatRoleAndStatesDoNotTell) {
  messages::setAccessibilityTraits(one, TraitHeader | TraitButton | TraitSelected);
  messages::setAccessibilityHint(one, string("Opens the map"));
  messages::setAccessibilityHint(two, string("two"));
  model.refresh();
  const Item& heading = *model.find(model.readingOrder()[0]);
  EXPECT_EQ(heading.name, "one, button, selected");
  EXPECT_EQ(heading.hint, "Opens the map");
  EXPECT_EQ(heading.line, "one, heading, button, selected, Opens the map");
  EXPECT_EQ(model.find(named("two"))->hint, "");
}

TEST_F(ScreenModelTest, ActingTellsWhatFollowedAndSurvivesAHostThatRaises) {
  const Ref<Lever> lever = make<Lever>();
  lever->setTitle(string("pull"));
  lever->setFrame({0, 300, 90, 20});
  screen->addSubview(lever);
  model.refresh();
  lever->work = [&] {
    two->setText(string("deux"));
    postNotification(LayoutChangedNotification);
    postNotification(LayoutChangedNotification, string("Two more"));
    postNotification(LayoutChangedNotification, three);
  };
  const Effect effect = operate(model, reader::Action::activate, named("pull"));
  EXPECT_EQ(effect.result, reader::ActionResult::done);
  EXPECT_EQ(effect.announcements, (Names{"Layout changed", "Two more", "Layout changed"}));
  EXPECT_EQ(effect.change.changed.size(), 1u);
  EXPECT_EQ(focused(), "three");
  EXPECT_TRUE(effect.change.isElsewhere);

  lever->work = [] { throw std::runtime_error("jammed"); };
  EXPECT_EQ(operate(model, reader::Action::activate, named("pull")).announcements,
            Names{"The app failed while it was acted on"});
  EXPECT_EQ(operate(model, reader::Action::activate, named("one")).announcements, Names{"Nothing happened"});
  EXPECT_EQ(operate(model, reader::Action::activate, 0).result, reader::ActionResult::gone);
}

TEST_F(ScreenModelTest, WhatCoversTheScreenGoesItsOwnWayElseItIsHidden) {
  const Ref<Cover> cover = pieces::view<Cover>({label("wait")});
  screen->addSubview(cover);
  cover->knowsHow = true;
  model.refresh();
  EXPECT_EQ(focused(), "wait, covers the rest of the screen");
  EXPECT_EQ(dismissModal(model, model.focus()).result, reader::ActionResult::done);
  EXPECT_EQ(namesOf(model.readingOrder()), (Names{"one", "two", "three"}));

  cover->knowsHow = false;
  screen->addSubview(cover);
  model.refresh();
  dismissModal(model, model.focus());
  EXPECT_EQ(cover->escapes, 2);
  EXPECT_TRUE(cover->isHidden());
  EXPECT_EQ(focused(), "one");
  EXPECT_EQ(dismissModal(model, model.focus()).announcements, Names{"Nothing happened"});
}

TEST_F(ScreenModelTest, PagesCountAsTheyAreSpoken) {
  const Ref<PageControl> pages = pieces::view<PageControl>({}, {0, 300, 90, 20});
  pages->setNumberOfPages(3);
  screen->addSubview(pages);
  model.refresh();
  const ItemId id = model.readingOrder().back();
  EXPECT_EQ(model.find(id)->position, (Position{1, 1, 3}));
  const Effect effect = operate(model, reader::Action::increment, id);
  ASSERT_EQ(effect.change.changed.size(), 1u);
  EXPECT_TRUE(effect.change.changed[0].position && effect.change.changed[0].name);
  EXPECT_EQ(model.find(id)->name, "Page 2 of 3");
}

}  // namespace ax::view
