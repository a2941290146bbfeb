#pragma once

#include <array>
#include <initializer_list>

#include "platform/runtime/SafeCategory.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/DataSeriesMessages.h"

namespace ax {

// The rows of one category while they are gathered, which is when it is compiled.
struct OverrideList {
  std::array<Override, 48> rows = {};
  std::size_t count = 0;

  constexpr void add(const Override& row) { rows[count++] = row; }
};

template <class C>
concept DataSeries = requires {
  &C::accessibilityContainerType;
  &C::accessibilityElements;
  &C::_accessibilityDataSeriesSupportsSummarization;
  &C::_accessibilityDataSeriesSupportsSonification;
  &C::_accessibilityDataSeriesType;
  &C::_accessibilityDataSeriesValuesForAxis;
  &C::_accessibilityDataSeriesTitleForAxis;
  &C::_accessibilityDataSeriesUnitLabelForAxis;
  &C::_accessibilityDataSeriesMinimumValueForAxis;
  &C::_accessibilityDataSeriesMaximumValueForAxis;
};

// A public method of C's that is named as one of these messages answers it, also when C inherits it: with
// another type it does not compile. Other messages take a row of their own.
template <class C>
constexpr void addStandardOverrides(OverrideList& list) {
  static_assert(
      DataSeries<C> || !requires { &C::_accessibilityDataSeriesType; },
      "a chart answers all that a data series answers");
#define AX_ANSWERS(name) \
  if constexpr (requires { &C::name; }) list.add(overrides<&C::name>(messages::name))
  AX_ANSWERS(isAccessibilityElement);
  AX_ANSWERS(accessibilityLabel);
  AX_ANSWERS(accessibilityValue);
  AX_ANSWERS(accessibilityHint);
  AX_ANSWERS(accessibilityTraits);
  AX_ANSWERS(accessibilityFrame);
  AX_ANSWERS(accessibilityElements);
  AX_ANSWERS(accessibilityContainer);
  AX_ANSWERS(accessibilityActivationPoint);
  AX_ANSWERS(accessibilityUserDefinedLabel);
  AX_ANSWERS(accessibilityContainerType);
  AX_ANSWERS(accessibilityPath);
  AX_ANSWERS(accessibilityViewIsModal);
  AX_ANSWERS(accessibilityActivate);
  AX_ANSWERS(accessibilityIncrement);
  AX_ANSWERS(accessibilityDecrement);
  AX_ANSWERS(_accessibilityExpandedStatus);
  AX_ANSWERS(_accessibilityHitTest);
  AX_ANSWERS(_accessibilityLoadAccessibilityInformation);
  AX_ANSWERS(layoutSubviews);
  AX_ANSWERS(loadView);
  AX_ANSWERS(viewDidLoad);
  AX_ANSWERS(_accessibilityDataSeriesSupportsSummarization);
  AX_ANSWERS(_accessibilityDataSeriesSupportsSonification);
  AX_ANSWERS(_accessibilityDataSeriesType);
  AX_ANSWERS(_accessibilityDataSeriesName);
  AX_ANSWERS(_accessibilityDataSeriesValuesForAxis);
  AX_ANSWERS(_accessibilityDataSeriesTitleForAxis);
  AX_ANSWERS(_accessibilityDataSeriesUnitLabelForAxis);
  AX_ANSWERS(_accessibilityDataSeriesMinimumValueForAxis);
  AX_ANSWERS(_accessibilityDataSeriesMaximumValueForAxis);
  AX_ANSWERS(_accessibilityDataSeriesValueDescriptionForPositionAxis);
  AX_ANSWERS(_accessibilityShouldUseSlices);
  AX_ANSWERS(_accessibilityNumberOfSlices);
  AX_ANSWERS(_accessibilityTimeIntervalPerSlice);
  AX_ANSWERS(_accessibilityHoursPerSlice);
  AX_ANSWERS(_accessibilityQuantityForSliceAtIndex);
#undef AX_ANSWERS
}

template <class C>
constexpr OverrideList overridesOf(std::initializer_list<Override> own) {
  OverrideList list;
  addStandardOverrides<C>(list);
  for (const Override& row : own) list.add(row);
  return list;
}

template <std::size_t Count>
constexpr std::array<Override, Count> firstRows(const OverrideList& list) {
  std::array<Override, Count> rows;
  for (std::size_t i = 0; i < Count; ++i) rows[i] = list.rows[i];
  return rows;
}

}  // namespace ax
