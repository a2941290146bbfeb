#include "host/daydetail/StepsDistanceCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void()> setupSubviewsMessage{"_setupSubviews"};

void makeCaption(Ref<Label>& label, const char* key) {
  if (label) return;
  label = make<Label>();
  label->setText(HostStrings::textForKey(string(key)));
}

void makeFigure(Ref<Label>& label) {
  if (!label) label = make<Label>();
}

}  // namespace

Class& StepsDistanceCell::staticClass() {
  using T = StepsDistanceCell;
  static Class& result = ClassBuilder<T>("StepsDistanceCell", TableViewCell::staticClass())
                             .instanceVariable<&T::stepsTitle_>("_stepsTitle")
                             .instanceVariable<&T::stepsValue_>("_stepsValue")
                             .instanceVariable<&T::distanceTitle_>("_distanceTitle")
                             .instanceVariable<&T::distanceValue_>("_distanceValue")
                             .instanceVariable<&T::flightsTitle_>("_flightsTitle")
                             .instanceVariable<&T::flightsValue_>("_flightsValue")
                             .method<&T::setupSubviews>("_setupSubviews")
                             .build();
  return result;
}

void StepsDistanceCell::setupSubviews() {
  isSetUp_ = true;
  makeCaption(stepsTitle_, "day.steps.title");
  makeFigure(stepsValue_);
  makeCaption(distanceTitle_, "day.distance.title");
  makeFigure(distanceValue_);
  makeCaption(flightsTitle_, "day.flights.title");
  makeFigure(flightsValue_);
  addUnplaced(*contentView(),
              {stepsTitle_, stepsValue_, distanceTitle_, distanceValue_, flightsTitle_, flightsValue_});
}

void StepsDistanceCell::layoutSubviews() {
  if (!isSetUp_) setupSubviewsMessage(*this);
}

static const RegisteredClass<StepsDistanceCell> registered;

}  // namespace ax::host
