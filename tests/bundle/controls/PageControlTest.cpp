#include <gtest/gtest.h>

#include <random>

#include "host/daydetail/ChartDetailCell.h"
#include "host/daydetail/LoadingView.h"
#include "platform/accessibility/Notifications.h"
#include "platform/runtime/ClassBuilder.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"

// What a scene cannot show of the controls: many adjustments in a row, a control that finds its chart by
// itself, and what the bundle leaves alone.
namespace ax {

namespace {

// A page control of the app's own that knows its chart.
class ChartPageControl : public PageControl {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<ChartPageControl>("ChartPageControl", PageControl::staticClass())
                               .method<&ChartPageControl::ownChart>("_axScrollView")
                               .build();
    return result;
  }
  Ref<Object> ownChart() { return chart; }
  Ref<Object> chart;
};

class PageControlTest : public testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NO_FATAL_FAILURE(startBundle());
    forgetReports();
    chart_->setFrame({0, 0, 320, 160});
  }

  static std::size_t graftedMethodsOf(const Class& target) {
    std::size_t count = 0;
    target.forEachOwnMethod([&](const Method& method) { count += method.graft != nullptr; });
    return count;
  }

  const Ref<ScrollView> chart_ = make<ScrollView>();
};

TEST_F(PageControlTest, TheChartNeverLosesThePage) {
  const auto cell = make<host::ChartDetailCell>();
  EXPECT_TRUE(cell->isa().instanceVariable("_scrollview"_key)->write(*cell, chart_));
  const auto pages = make<PageControl>();
  pages->setNumberOfPages(5);
  cell->contentView()->addSubview(pages);
  std::mt19937 random(20260308);
  std::int64_t expected = 0;
  for (std::size_t step = 1; step <= 200; ++step) {
    const bool forward = random() % 2 == 0;
    const double width = 100 + random() % 300;
    const double height = static_cast<double>(random() % 50);
    chart_->setFrame({0, 0, width, 160});
    chart_->setContentOffset({7, height});
    (forward ? messages::accessibilityIncrement : messages::accessibilityDecrement)(pages);
    expected = std::clamp<std::int64_t>(expected + (forward ? 1 : -1), 0, 4);
    ASSERT_EQ(pages->currentPage(), expected);
    ASSERT_EQ(chart_->contentOffset(), (Point{width * static_cast<double>(expected), height}));
    ASSERT_EQ(postedNotifications().size(), step);
  }
}

TEST_F(PageControlTest, AControlMayFindItsChartItself) {
  const auto pages = make<ChartPageControl>();
  pages->chart = chart_;
  pages->setNumberOfPages(3);
  messages::accessibilityIncrement(pages);
  EXPECT_EQ(chart_->contentOffset(), (Point{320, 0}));
  pages->chart = make<View>();  // it scrolls nothing
  messages::accessibilityIncrement(pages);
  EXPECT_EQ(pages->currentPage(), 2);
  EXPECT_EQ(chart_->contentOffset(), (Point{320, 0}));
  EXPECT_EQ(postedNotifications().size(), 2u);
}

TEST_F(PageControlTest, WithoutPagesThereIsNothingToTurn) {
  const auto cell = make<host::ChartDetailCell>();
  EXPECT_TRUE(cell->isa().instanceVariable("_scrollview"_key)->write(*cell, chart_));
  const auto pages = make<PageControl>();
  cell->contentView()->addSubview(pages);
  chart_->setContentOffset({640, 3});
  messages::accessibilityIncrement(pages);
  EXPECT_EQ(pages->currentPage(), 0);
  EXPECT_EQ(chart_->contentOffset(), (Point{0, 3}));
}

TEST_F(PageControlTest, ButtonsAndScrollViewsStayTheToolkitsOwn) {
  EXPECT_EQ(graftedMethodsOf(Button::staticClass()), 0u);
  EXPECT_EQ(graftedMethodsOf(ScrollView::staticClass()), 0u);
  EXPECT_EQ(graftedMethodsOf(PageControl::staticClass()), 4u);
  EXPECT_TRUE(messages::accessibilityViewIsModal(make<host::LoadingView>()));
  EXPECT_FALSE(messages::accessibilityViewIsModal(chart_));
}

}  // namespace

}  // namespace ax
