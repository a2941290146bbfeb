#include <gtest/gtest.h>

#include "host/charts/CHNoHeartRateDataViewController.h"
#include "host/charts/CHWorkoutDetailHeartRateChartTableViewCell.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// What stands in place of a heart rate: blocks that outlive what they were made for, and overlays that
// change.
namespace ax {

namespace {

class HeartRateCellTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static const AccessibilityProperties::Blocks& blocksOf(const Object& object) {
    return *AccessibilityProperties::find(object)->blocks;
  }

  const Message<void()> create_{"_createAndConstraintNoDataOverlay"};
  const EnvironmentScope environment_{Environment{.locale = "en_US", .now = 1780000000}};
  Ref<host::CHWorkoutDetailHeartRateChartTableViewCell> cell_ =
      make<host::CHWorkoutDetailHeartRateChartTableViewCell>();
};

TEST_F(HeartRateCellTest, ItsOverlayIsOneButtonWhileItShows) {
  create_(cell_);
  const Ref<View> overlay = member<View>(*cell_, "_noDataOverlayView");
  EXPECT_TRUE(messages::isAccessibilityElement(overlay));
  EXPECT_EQ(labelOf(overlay), "No heart rate data");
  EXPECT_EQ(messages::accessibilityTraits(overlay), TraitButton);
  EXPECT_TRUE(messages::accessibilityActivate(overlay));
  EXPECT_TRUE(cell_->safeBoolForKey("_showsExplanation"_key));
  overlay->setHidden(true);
  EXPECT_FALSE(messages::isAccessibilityElement(overlay));
  overlay->setHidden(false);
  EXPECT_TRUE(messages::isAccessibilityElement(overlay)) << "asked each time";
}

TEST_F(HeartRateCellTest, ItsOverlaySpeaksWhatItHoldsNow) {
  create_(cell_);
  const Ref<View> overlay = member<View>(*cell_, "_noDataOverlayView");
  cast<Label>(overlay->subviews()[0].get())->setText(string("Nothing measured"));
  EXPECT_EQ(labelOf(overlay), "Nothing measured");
  overlay->subviews()[0]->removeFromSuperview();
  EXPECT_EQ(labelOf(overlay), "Learn more about heart rate") << "without a label, all that speaks in it";
  const auto nested = make<View>();
  const auto label = make<Label>();
  label->setText(string("Deep"));
  nested->addSubview(label);
  overlay->addSubview(nested);
  EXPECT_EQ(labelOf(overlay), "Learn more about heart rate, Deep");
  overlay->subviews()[0]->removeFromSuperview();
  EXPECT_FALSE(messages::accessibilityActivate(overlay)) << "no button is left";
}

TEST_F(HeartRateCellTest, ItsBlocksKeepNothingAlive) {
  create_(cell_);
  Ref<View> overlay = member<View>(*cell_, "_noDataOverlayView");
  const auto isElement = blocksOf(*overlay).isElement;
  const auto label = blocksOf(*overlay).label;
  const auto activate = blocksOf(*overlay).activate;
  const Weak<View> weak = overlay;
  cell_ = nullptr;
  EXPECT_TRUE(isElement()) << "the overlay itself is still held";
  overlay = nullptr;
  EXPECT_FALSE(weak);
  EXPECT_FALSE(isElement());
  EXPECT_EQ(plain(label()), "");
  EXPECT_FALSE(activate());
}

TEST_F(HeartRateCellTest, AnotherOverlayIsPreparedAtTheNextLoad) {
  create_(cell_);
  const auto other = make<View>();
  setMember(*cell_, "_noDataOverlayView", other);
  EXPECT_FALSE(messages::isAccessibilityElement(other));
  load(cell_);
  EXPECT_TRUE(messages::isAccessibilityElement(other));
  EXPECT_EQ(labelOf(other), "");
  setMember(*cell_, "_noDataOverlayView", nullptr);
  EXPECT_NO_THROW(load(cell_));
}

TEST_F(HeartRateCellTest, NothingIsPreparedWhenTheHostMakesNoOverlay) {
  const auto overlay = make<View>();
  setMember(*cell_, "_noDataOverlayView", overlay);
  ASSERT_TRUE(setScriptedAnswer(*cell_, create_.selector(),
                                [](auto) -> Ref<Object> { throw std::runtime_error("no overlay"); }));
  EXPECT_THROW(create_(cell_), std::runtime_error);
  EXPECT_FALSE(messages::isAccessibilityElement(overlay));
}

TEST_F(HeartRateCellTest, TheLinkFollowsItsLabelUntilTheScreenIsGone) {
  auto screen = make<host::CHNoHeartRateDataViewController>();
  messages::loadView(screen);
  messages::loadView(screen);
  EXPECT_EQ(screen->view()->subviews().size(), 4u) << "loading twice adds nothing";
  const Ref<Button> button = screen->linkButton();
  EXPECT_EQ(labelOf(button), "Learn more about heart rate");
  EXPECT_TRUE(messages::isAccessibilityElement(button)) << "though it has no title of its own";
  EXPECT_FALSE(messages::isAccessibilityElement(screen->linkLabel()));
  EXPECT_NE(messages::accessibilityTraits(screen->titleLabel()) & TraitHeader, 0u);
  screen->linkLabel()->setText(string("More"));
  EXPECT_EQ(labelOf(button), "More");
  const auto other = make<Label>();
  other->setText(string("Other"));
  screen->setLinkLabel(other);
  EXPECT_EQ(labelOf(button), "Other");
  EXPECT_TRUE(messages::isAccessibilityElement(other)) << "hidden only when it is loaded";
  const Weak<Object> weak = *screen;
  screen = nullptr;
  EXPECT_FALSE(weak);
  EXPECT_EQ(labelOf(button), "(none)");
  EXPECT_FALSE(button->sendAction());
}

}  // namespace

}  // namespace ax
