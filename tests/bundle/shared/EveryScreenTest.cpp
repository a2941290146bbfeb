#include <gtest/gtest.h>

#include <set>
#include <stdexcept>

#include "platform/runtime/ScriptedAnswers.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/TableViewCell.h"
#include "platform/toolkit/ViewController.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/bundle/shared/FurnishedScreens.h"
#include "tests/platform/EnvironmentScope.h"

// What holds of every class that the bundle extends.
namespace ax {

namespace {

class EveryScreenTest : public testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NO_FATAL_FAILURE(startBundle());
    classes_ = extendedClasses();
    ASSERT_GT(classes_.size(), 55u);
  }

  static Ref<Object> furnished(const Class& target) {
    Ref<Object> made = target.instantiate();
    furnish(*made);
    return made;
  }

  const EnvironmentScope environment_{Environment{.timeZone = "America/Santiago", .now = 1780000000}};
  std::vector<Class*> classes_;
};

// Neither the host's parts nor what the bundle keeps on them may hold their owner.
TEST_F(EveryScreenTest, EndsWithAllItsPartsAndElements) {
  for (const Class* target : classes_) {
    Ref<Object> screen = furnished(*target);
    std::vector<std::pair<std::string, Weak<Object>>> parts;
    {
      show(*screen);
      load(screen);
      ObjectSet answers;
      for (const auto& [object, part] : everythingIn(*screen)) askEverything(*part, answers);
      for (const auto& [object, part] : everythingIn(*screen)) parts.emplace_back(part->isa().name(), part);
      for (const auto& [object, answer] : answers) {
        if (cast<AccessibilityElement>(answer.get()) != nullptr)
          parts.emplace_back(answer->isa().name(), answer);
      }
    }
    ASSERT_FALSE(parts.empty());
    screen = nullptr;
    for (const auto& [name, part] : parts) EXPECT_FALSE(part) << name << " outlives " << target->name();
  }
}

std::map<Object*, Rect> places(Object& screen) {
  std::map<Object*, Rect> places;
  for (const auto& [object, part] : everythingIn(screen)) {
    if (cast<View>(part.get()) != nullptr || cast<Layer>(part.get()) != nullptr)
      places[object] = messages::accessibilityFrame(part);
  }
  return places;
}

TEST_F(EveryScreenTest, StaysAsItIsWhenItIsShownAgain) {
  for (const Class* target : classes_) {
    const Ref<Object> screen = furnished(*target);
    show(*screen);
    load(screen);
    const std::map<Object*, Rect> before = places(*screen);
    const std::string label = labelOf(screen);
    const Traits traits = messages::accessibilityTraits(screen);
    show(*screen);
    load(screen);
    EXPECT_EQ(places(*screen), before) << target->name();
    EXPECT_EQ(labelOf(screen), label) << target->name();
    EXPECT_EQ(messages::accessibilityTraits(screen), traits) << target->name();
  }
}

TEST_F(EveryScreenTest, IsSilentWhereTheHostRaises) {
  std::size_t raising = 0;
  for (const Class* target : classes_) {
    for (const Method* method : hostMethods(*target)) {
      if (method->signature->encodings[0] == "v" || method->selector.name().starts_with("init")) continue;
      const Ref<Object> screen = furnished(*target);
      show(*screen);
      raising += setScriptedAnswer(*screen, method->selector,
                                   [](auto) -> Ref<Object> { throw std::runtime_error("no answer"); });
      ObjectSet answers;
      EXPECT_NO_THROW(load(screen)) << target->name() << ' ' << method->selector.name();
      EXPECT_NO_THROW(askEverything(*screen, answers)) << target->name() << ' ' << method->selector.name();
    }
  }
  EXPECT_GT(raising, 30u);
}

TEST_F(EveryScreenTest, IsSilentWithoutAnyPart) {
  for (const Class* target : classes_) {
    const Ref<Object> screen = target->instantiate();
    ObjectSet answers;
    EXPECT_NO_THROW(load(screen)) << target->name();
    EXPECT_NO_THROW(askEverything(*screen, answers)) << target->name();
    const Ref<Array> elements = messages::accessibilityElements(screen);
    if (!elements) continue;
    for (const Ref<Object>& element : *elements) {
      EXPECT_NE(messages::accessibilityContainer(element), nullptr) << target->name();
    }
  }
}

// A reader that goes through the lists must come to an end, and to no element twice.
TEST_F(EveryScreenTest, ListsEveryElementOnce) {
  for (const Class* target : classes_) {
    const Ref<Object> screen = furnished(*target);
    show(*screen);
    load(screen);
    std::set<Object*> found;
    const auto isNew = [&](Object& object) {
      EXPECT_TRUE(found.insert(&object).second) << object.isa().name() << " is twice in " << target->name();
      return found.size() < 1000;
    };
    _accessibilityFindUnsortedDescendantsPassingTest(screen, isNew);
    EXPECT_LT(found.size(), 1000u) << target->name();
  }
}

}  // namespace

}  // namespace ax
