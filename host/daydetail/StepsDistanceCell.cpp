#include "host/daydetail/StepsDistanceCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void()> setupSubviewsMessage{"_setupSubviews"};

Ref<Label> labelAt(int column, double y) {
  const Ref<Label> label = make<Label>();
  label->setFrame({16 + column * 120.0, y, 110, 22});
  return label;
}

void makePair(Ref<Label>& title, Ref<Label>& value, const char* key, int column) {
  if (!title) {
    title = labelAt(column, 8);
    title->setText(HostStrings::textForKey(string(key)));
  }
  if (!value) value = labelAt(column, 30);
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
  makePair(stepsTitle_, stepsValue_, "day.steps.title", 0);
  makePair(distanceTitle_, distanceValue_, "day.distance.title", 1);
  makePair(flightsTitle_, flightsValue_, "day.flights.title", 2);
  addUnplaced(*contentView(),
              {stepsTitle_, stepsValue_, distanceTitle_, distanceValue_, flightsTitle_, flightsValue_});
}

void StepsDistanceCell::layoutSubviews() {
  if (!isSetUp_) setupSubviewsMessage(*this);
}

static const RegisteredClass<StepsDistanceCell> registered;

}  // namespace ax::host
