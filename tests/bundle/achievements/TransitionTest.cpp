#include <gtest/gtest.h>

#include "host/achievements/CHAchievementDetailTransitionAnimator.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"

// What a scene cannot show of the flip to an achievement: its blocks, and a host that refuses.
namespace ax {

namespace {

using Block = std::function<void()>;
using Animator = host::CHAchievementDetailTransitionAnimator;
const Message<Ref<Object>(Ref<Object>, Ref<Object>, bool, Rect, Ref<Object>, Block, Block, Block)> start{
    "initWithPresentingViewController:detailViewController:shouldPlayFlipInAnimation:initialBadgeFrame:"
    "conversionView:presentAlongsideBlock:dismissAlongsideBlock:completionBlock:"};

class TransitionTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  Ref<host::ODUIBadgeView> giveBadge() {
    const auto badge = make<host::ODUIBadgeView>();
    EXPECT_TRUE(detail_->isa().instanceVariable("_badgeView"_key)->write(*detail_, badge));
    return badge;
  }

  const Ref<Animator> animator_ = make<Animator>();
  const Ref<host::CHAchievementDetailViewController> detail_ =
      make<host::CHAchievementDetailViewController>();
};

TEST_F(TransitionTest, HandsEveryBlockOverInItsPlace) {
  std::string ran;
  const Ref<Object> made = start(
      animator_, nullptr, detail_, false, {}, nullptr, [&] { ran += "present "; }, [&] { ran += "dismiss "; },
      [&] { ran += "complete "; });
  EXPECT_EQ(made, animator_);
  EXPECT_EQ(ran, "");
  animator_->finishPresenting();
  EXPECT_EQ(ran, "present complete ");
}

TEST_F(TransitionTest, TakesBlocksThatAreEmpty) {
  const Ref<host::ODUIBadgeView> badge = giveBadge();
  start(animator_, nullptr, detail_, false, {}, nullptr, nullptr, nullptr, nullptr);
  animator_->finishPresenting();
  EXPECT_FALSE(messages::isAccessibilityElement(badge));
}

TEST_F(TransitionTest, LetsAFlipWithoutAnimationShowTheContainer) {
  detail_->setBadgeContainer(make<View>());
  start(animator_, nullptr, detail_, false, {1, 2, 3, 4}, nullptr, {}, {}, {});
  EXPECT_EQ(detail_->badgeContainer()->alpha(), 1);
  start(animator_, nullptr, detail_, true, {1, 2, 3, 4}, nullptr, {}, {}, {});
  EXPECT_EQ(detail_->badgeContainer()->alpha(), 0);
}

TEST_F(TransitionTest, TouchesNothingWhenTheHostMakesNoAnimator) {
  const Ref<host::ODUIBadgeView> badge = giveBadge();
  EXPECT_TRUE(setScriptedAnswer(*animator_, start.selector(), [](auto) { return Ref<Object>(); }));
  EXPECT_EQ(start(animator_, nullptr, detail_, true, {}, nullptr, {}, {}, {}), nullptr);
  EXPECT_TRUE(messages::isAccessibilityElement(badge));
}

TEST_F(TransitionTest, LetsTheHostsOwnFaultThrough) {
  const Ref<host::ODUIBadgeView> badge = giveBadge();
  EXPECT_TRUE(setScriptedAnswer(*animator_, start.selector(),
                                [](auto) -> Ref<Object> { throw std::runtime_error("no transition"); }));
  EXPECT_THROW(start(animator_, nullptr, detail_, true, {}, nullptr, {}, {}, {}), std::runtime_error);
  EXPECT_TRUE(messages::isAccessibilityElement(badge));
}

}  // namespace

}  // namespace ax
