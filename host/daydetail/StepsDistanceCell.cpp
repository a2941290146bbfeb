#include "host/daydetail/StepsDistanceCell.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void()> setupSubviewsMessage{"_setupSubviews"};

Ref<Label> labelAt(const View& cell, int column, double y) {
  const Ref<Label> label = make<Label>();
  label->setFrame(inDirection(cell, {16 + column * 120.0, y, 110, 22}));
  return label;
}

void makePair(const View& cell, Ref<Label>& title, Ref<Label>& value, const char* key, int column) {
  if (!title) {
    title = labelAt(cell, column, 8);
    title->setText(hostText(key));
  }
  if (!value) value = labelAt(cell, column, 30);
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
  makePair(*this, stepsTitle_, stepsValue_, "day.steps.title", 0);
  makePair(*this, distanceTitle_, distanceValue_, "day.distance.title", 1);
  makePair(*this, flightsTitle_, flightsValue_, "day.flights.title", 2);
  addUnplaced(*contentView(),
              {stepsTitle_, stepsValue_, distanceTitle_, distanceValue_, flightsTitle_, flightsValue_});
}

void StepsDistanceCell::layoutSubviews() {
  if (!isSetUp_) setupSubviewsMessage(*this);
}

static const RegisteredClass<StepsDistanceCell> registered;

}  // namespace ax::host
