#include "host/achievements/CHAchievementDetailTransitionAnimator.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

void setOpacityOfBadge(const Ref<CHAchievementDetailViewController>& detail, double alpha) {
  if (detail && detail->badgeContainer()) detail->badgeContainer()->setAlpha(alpha);
}

}  // namespace

Class& CHAchievementDetailTransitionAnimator::staticClass() {
  using T = CHAchievementDetailTransitionAnimator;
  static Class& result =
      ClassBuilder<T>("CHAchievementDetailTransitionAnimator", Object::staticClass())
          .instanceVariable<&T::presentingViewController_>("_presentingViewController")
          .instanceVariable<&T::detailViewController_>("_detailViewController")
          .instanceVariable<&T::conversionView_>("_conversionView")
          .instanceVariable<&T::initialBadgeFrame_>("_initialBadgeFrame")
          .instanceVariable<&T::shouldPlayFlipInAnimation_>("_shouldPlayFlipInAnimation")
          .method<&T::init>(
              "initWithPresentingViewController:detailViewController:shouldPlayFlipInAnimation:"
              "initialBadgeFrame:conversionView:presentAlongsideBlock:dismissAlongsideBlock:completionBlock:")
          .method<&T::finishPresenting>("finishPresenting")
          .build();
  return result;
}

Ref<Object> CHAchievementDetailTransitionAnimator::init(Ref<ViewController> presenting,
                                                        Ref<CHAchievementDetailViewController> detail,
                                                        bool shouldPlayFlipInAnimation,
                                                        Rect initialBadgeFrame, Ref<View> conversionView,
                                                        Block presentAlongside, Block dismissAlongside,
                                                        Block completion) {
  presentingViewController_ = std::move(presenting);
  detailViewController_ = std::move(detail);
  shouldPlayFlipInAnimation_ = shouldPlayFlipInAnimation;
  initialBadgeFrame_ = initialBadgeFrame;
  conversionView_ = std::move(conversionView);
  presentAlongside_ = std::move(presentAlongside);
  dismissAlongside_ = std::move(dismissAlongside);
  completion_ = std::move(completion);
  if (shouldPlayFlipInAnimation_) setOpacityOfBadge(detailViewController_, 0);
  return Ref<Object>(this);
}

void CHAchievementDetailTransitionAnimator::finishPresenting() {
  setOpacityOfBadge(detailViewController_, 1);
  if (presentAlongside_) presentAlongside_();
  if (completion_) completion_();
}

static const RegisteredClass<CHAchievementDetailTransitionAnimator> registered;

}  // namespace ax::host
