#pragma once

#include <functional>

#include "host/achievements/CHAchievementDetailViewController.h"

namespace ax::host {

// Presents the screen of an achievement: its badge flips out of the grid into its place.
class CHAchievementDetailTransitionAnimator : public Object {
 public:
  static Class& staticClass();
  using Block = std::function<void()>;

  // Keeps what it is given and answers itself. While the badge flips in, the container on the detail screen
  // is transparent.
  Ref<Object> init(Ref<ViewController> presenting, Ref<CHAchievementDetailViewController> detail,
                   bool shouldPlayFlipInAnimation, Rect initialBadgeFrame, Ref<View> conversionView,
                   Block presentAlongside, Block dismissAlongside, Block completion);
  // The badge has arrived: the container is opaque again, and the blocks for presenting and for completion
  // have run.
  void finishPresenting();

 private:
  Ref<ViewController> presentingViewController_;
  Ref<CHAchievementDetailViewController> detailViewController_;
  Ref<View> conversionView_;
  Rect initialBadgeFrame_;
  Block presentAlongside_;
  Block dismissAlongside_;
  Block completion_;
  bool shouldPlayFlipInAnimation_ = false;
};

}  // namespace ax::host
