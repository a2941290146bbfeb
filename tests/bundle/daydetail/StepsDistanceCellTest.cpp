#include <gtest/gtest.h>

#include "host/daydetail/StepsDistanceCell.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

namespace ax {

namespace {

class StepsDistanceCellTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  Ref<Label> labelFor(Key key) { return cast<Label>(cell_->safeValueForKey(key)); }

  const EnvironmentScope environment_{Environment{.locale = "fr_FR", .now = 1780000000}};
  Ref<host::StepsDistanceCell> cell_ = make<host::StepsDistanceCell>();
};

TEST_F(StepsDistanceCellTest, IsReadInThreePairsAfterItsFirstLayout) {
  messages::layoutSubviews(cell_);
  labelFor("_stepsValue"_key)->setText(string("8 412"));
  labelFor("_flightsValue"_key)->setText(string("7"));
  const Ref<Array> elements = messages::accessibilityElements(cell_);
  ASSERT_EQ(elements->count(), 3u);
  std::string spoken;
  for (const Ref<Object>& pair : *elements) {
    spoken += labelOf(pair) + ": " + valueOf(pair);
    spoken += messages::isAccessibilityElement(pair) ? "; " : " (silent); ";
  }
  EXPECT_EQ(spoken, "Pas: 8 412; Distance: (none) (silent); Étages montés: 7; ");
}

TEST_F(StepsDistanceCellTest, KeepsItsElementsThroughFurtherLayouts) {
  messages::layoutSubviews(cell_);
  const Ref<Object> steps = messages::accessibilityElements(cell_)->at(0);
  messages::layoutSubviews(cell_);
  EXPECT_EQ(messages::accessibilityElements(cell_)->at(0), steps);
}

TEST_F(StepsDistanceCellTest, EndsThoughSomebodyHoldsItsElements) {
  messages::layoutSubviews(cell_);
  labelFor("_stepsValue"_key)->setText(string("8 412"));
  const Ref<Array> elements = messages::accessibilityElements(cell_);
  const Weak<Object> weak = *cell_;
  cell_ = nullptr;
  EXPECT_EQ(weak.lock(), nullptr);
  EXPECT_EQ(messages::accessibilityContainer(elements->at(0)), nullptr);
  EXPECT_EQ(valueOf(elements->at(0)), "8 412");
}

}  // namespace

}  // namespace ax
