#pragma once

#include <cstdint>

#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"
#include "platform/runtime/Message.h"
#include "platform/runtime/Number.h"

// How a chart describes itself as a data series with two axes, and as a row of equal time slices. What a
// chart leaves out is nil, NO or 0.
namespace ax {

enum Axis : std::int64_t { horizontalAxis = 0, verticalAxis = 1 };
enum DataSeriesType : std::int64_t { lineSeries = 0, barSeries = 2 };

}  // namespace ax

namespace ax::messages {

// The accessibilityContainerType of a chart that is a data series.
inline constexpr std::int64_t dataSeriesContainerType = 13;

inline constinit const Message<bool()> _accessibilityDataSeriesSupportsSummarization{
    "_accessibilityDataSeriesSupportsSummarization"};
inline constinit const Message<bool()> _accessibilityDataSeriesSupportsSonification{
    "_accessibilityDataSeriesSupportsSonification"};
inline constinit const Message<std::int64_t()> _accessibilityDataSeriesType{"_accessibilityDataSeriesType"};
inline constinit const Message<Ref<String>()> _accessibilityDataSeriesName{"_accessibilityDataSeriesName"};
// Numbers, one per point, in the points' order.
inline constinit const Message<Ref<Array>(std::int64_t)> _accessibilityDataSeriesValuesForAxis{
    "_accessibilityDataSeriesValuesForAxis:"};
inline constinit const Message<Ref<String>(std::int64_t)> _accessibilityDataSeriesTitleForAxis{
    "_accessibilityDataSeriesTitleForAxis:"};
inline constinit const Message<Ref<String>(std::int64_t)> _accessibilityDataSeriesUnitLabelForAxis{
    "_accessibilityDataSeriesUnitLabelForAxis:"};
inline constinit const Message<Ref<Number>(std::int64_t)> _accessibilityDataSeriesMinimumValueForAxis{
    "_accessibilityDataSeriesMinimumValueForAxis:"};
inline constinit const Message<Ref<Number>(std::int64_t)> _accessibilityDataSeriesMaximumValueForAxis{
    "_accessibilityDataSeriesMaximumValueForAxis:"};
// The position runs from 0, the start of the axis, to 1, its end.
inline constinit const Message<Ref<String>(double, std::int64_t)>
    _accessibilityDataSeriesValueDescriptionForPositionAxis{
        "_accessibilityDataSeriesValueDescriptionForPosition:axis:"};

inline constinit const Message<bool()> _accessibilityShouldUseSlices{"_accessibilityShouldUseSlices"};
inline constinit const Message<std::uint64_t()> _accessibilityNumberOfSlices{"_accessibilityNumberOfSlices"};
// In seconds.
inline constinit const Message<double()> _accessibilityTimeIntervalPerSlice{
    "_accessibilityTimeIntervalPerSlice"};
inline constinit const Message<std::uint64_t()> _accessibilityHoursPerSlice{"_accessibilityHoursPerSlice"};
// The spoken quantity of the slice with that index, counted from 0.
inline constinit const Message<Ref<String>(std::uint64_t)> _accessibilityQuantityForSliceAtIndex{
    "_accessibilityQuantityForSliceAtIndex:"};

}  // namespace ax::messages
