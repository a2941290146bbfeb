#include "host/charts/CHWorkoutDetailHeartRateChartTableViewCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

namespace {

const Message<void()> createAndConstraintNoDataOverlay{"_createAndConstraintNoDataOverlay"};

}  // namespace

Class& CHWorkoutDetailHeartRateChartTableViewCell::staticClass() {
  using T = CHWorkoutDetailHeartRateChartTableViewCell;
  static Class& result =
      ClassBuilder<T>("CHWorkoutDetailHeartRateChartTableViewCell", TableViewCell::staticClass())
          .instanceVariable<&T::noDataOverlayView_>("_noDataOverlayView")
          .instanceVariable<&T::scrollView_>("_scrollView")
          .instanceVariable<&T::pageControl_>("_pageControl")
          .instanceVariable<&T::chartView_>("_chartView")
          .instanceVariable<&T::showsExplanation_>("_showsExplanation")
          .method<&T::_createAndConstraintNoDataOverlay>("_createAndConstraintNoDataOverlay")
          .method<&T::overlayButtonTapped>("overlayButtonTapped:")
          .build();
  return result;
}

void CHWorkoutDetailHeartRateChartTableViewCell::layoutSubviews() {
  View& content = *contentView();
  if (content.frame() == Rect()) content.setFrame(bounds());
  showIn(content, scrollView_, content.bounds());
  showIn(scrollView_ ? *scrollView_ : content, chartView_, content.bounds());
  const double height = content.frame().height;
  showIn(content, pageControl_, {0, height - 20, content.frame().width, 20});
  if (!chartView_) return;
  chartView_->showReadings();
  const bool isShown = chartView_->hasAdequateDataForDisplay();
  chartView_->setHidden(!isShown);
  if (!isShown) createAndConstraintNoDataOverlay(*this);
  if (noDataOverlayView_) noDataOverlayView_->setHidden(isShown);
}

void CHWorkoutDetailHeartRateChartTableViewCell::_createAndConstraintNoDataOverlay() {
  if (!noDataOverlayView_) {
    const Ref<Label> title = make<Label>();
    title->setText(hostText("no.heart.rate.title"));
    title->setFrame({0, 0, frame().width, 40});
    const Ref<Button> button = make<Button>();
    button->setTitle(hostText("no.heart.rate.link"));
    button->setFrame({0, 40, frame().width, 40});
    button->setTargetAction(*this, Selector::intern("overlayButtonTapped:"));
    noDataOverlayView_ = make<View>();
    noDataOverlayView_->addSubview(title);
    noDataOverlayView_->addSubview(button);
  }
  showIn(*contentView(), noDataOverlayView_, bounds());
}

void CHWorkoutDetailHeartRateChartTableViewCell::overlayButtonTapped(Ref<Object>) {
  showsExplanation_ = true;
}

static const RegisteredClass<CHWorkoutDetailHeartRateChartTableViewCell> registered;

}  // namespace ax::host
