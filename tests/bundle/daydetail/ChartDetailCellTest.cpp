#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "host/daydetail/ChartDetailCell.h"
#include "platform/accessibility/Notifications.h"
#include "platform/runtime/ClassBuilder.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"

// What a scene cannot show of a chart's cell: frames that are no numbers, cells that move, and hosts that
// refine the steps.
namespace ax {

namespace {

// A cell of the app's own that takes a step into its own hands.
class RefinedCell : public host::ChartDetailCell {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<RefinedCell>("RefinedCell", ChartDetailCell::staticClass())
                               .method<&RefinedCell::updateInset>("_axUpdateScrollViewInset")
                               .method<&RefinedCell::hideLabel>("_axHideChartLabel")
                               .build();
    return result;
  }
  void updateInset() { steps += "inset "; }
  void hideLabel() { steps += "label "; }
  std::string steps;
};

class ChartDetailCellTest : public testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NO_FATAL_FAILURE(startBundle());
    forgetReports();
    place(cell_);
  }

  void place(const Ref<host::ChartDetailCell>& cell) {
    value_->setFrame({16, 0, 300, 60});
    chart_->setFrame({16, 20, 320, 160});
    EXPECT_TRUE(cell->isa().instanceVariable("_value"_key)->write(*cell, value_));
    EXPECT_TRUE(cell->isa().instanceVariable("_scrollview"_key)->write(*cell, chart_));
  }

  double inset() { return _accessibilityVisibleContentInset(chart_).top; }

  const Ref<Label> value_ = make<Label>();
  const Ref<ScrollView> chart_ = make<ScrollView>();
  const Ref<host::ChartDetailCell> cell_ = make<host::ChartDetailCell>();
};

TEST_F(ChartDetailCellTest, ReportsAnInsetThatIsNoNumberAndKeepsTheLast) {
  messages::layoutSubviews(cell_);
  EXPECT_EQ(inset(), 40);
  const double nan = std::numeric_limits<double>::quiet_NaN();
  messages::setAccessibilityFrame(value_, {0, nan, 10, 10});
  messages::layoutSubviews(cell_);
  EXPECT_EQ(inset(), 40);
  ASSERT_EQ(failedAssertions().size(), 1u);
  EXPECT_EQ(failedAssertions()[0].line, 52);
  load(cell_);
  EXPECT_EQ(failedAssertions().size(), 2u);
  EXPECT_EQ(inset(), 40);
}

TEST_F(ChartDetailCellTest, CountsAHairAboveTheChartAsUnexpectedAndNothingAsNothing) {
  value_->setFrame({16, 0, 300, 20});
  messages::layoutSubviews(cell_);
  EXPECT_EQ(inset(), 0);
  EXPECT_TRUE(failedAssertions().empty());
  value_->setFrame({16, 0, 300, std::nextafter(20, 0)});
  messages::layoutSubviews(cell_);
  EXPECT_EQ(failedAssertions().size(), 1u);
}

// Both frames are on the screen, so that it does not matter where the cell stands, nor how far the page or
// the chart itself is scrolled.
TEST_F(ChartDetailCellTest, MovesWithItsPage) {
  const auto page = make<ScrollView>();
  page->setFrame({0, 88, 390, 700});
  page->addSubview(cell_);
  for (const double scrolled : {0.0, 250.0, -40.0}) {
    page->setContentOffset({0, scrolled});
    cell_->setFrame({0, 3 * scrolled, 390, 220});
    chart_->setContentOffset({scrolled, 0});
    messages::layoutSubviews(cell_);
    EXPECT_EQ(inset(), 40) << scrolled;
  }
  EXPECT_TRUE(failedAssertions().empty());
}

TEST_F(ChartDetailCellTest, RunsItsStepsThroughTheCell) {
  const auto refined = make<RefinedCell>();
  place(refined);
  messages::layoutSubviews(refined);
  EXPECT_EQ(refined->steps, "inset ");
  load(refined);
  EXPECT_EQ(refined->steps, "inset label inset ");
  const Message<void(Ref<Object>)> add{"addChartLabelWithUnit:"};
  add(refined, Unit::minuteUnit());
  EXPECT_EQ(refined->steps, "inset label inset label ");
  EXPECT_TRUE(messages::isAccessibilityElement(refined->chartLabel()));
}

TEST_F(ChartDetailCellTest, HidesTheLabelThatTheFirstLayoutAdds) {
  EXPECT_TRUE(cell_->isa().instanceVariable("_unit"_key)->write(*cell_, Unit::minuteUnit()));
  messages::layoutSubviews(cell_);
  ASSERT_NE(cell_->chartLabel(), nullptr);
  EXPECT_EQ(cell_->chartLabel()->superview(), chart_.get());
  EXPECT_FALSE(messages::isAccessibilityElement(cell_->chartLabel()));
}

}  // namespace

}  // namespace ax
