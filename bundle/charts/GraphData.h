#pragma once

#include "bundle/core/Category.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/DataSeriesMessages.h"

// What every chart of bars does with the host's list of points: it keeps its own copy on the chart view,
// answers from that copy, and makes one element per bar until the next refresh. Main thread only; `chart` is
// the host's view, which owns all that is kept here.
namespace ax {

namespace messages {
// The chart's copy of the host's list; nil before the first refresh and when the host has no points.
inline constinit const Message<Ref<Array>()> _accessibilityGraphData{"_accessibilityGraphData"};
}  // namespace messages

// Where a chart's points come from and under which name it keeps them.
struct GraphSource {
  Key member;             // of the host view
  Key graphKey;           // of the copy
  const Class* expected;  // what the list's first object must be; the others are not looked at
};

// Reads the host's list anew. A list that is missing, empty, or begins with another kind of object leaves the
// chart without graph data. The elements made so far are dropped either way.
void refreshGraphData(Object& chart, const GraphSource& source);

// The elements made since the last refresh. When there are none, the list is kept before `fill` is called
// with it, a `MutableArray&`, so that a query from within it finds the list as it grows. A list that stays
// empty is an answer too and is not made again.
template <class Fill>
Ref<Array> chartElements(Object& chart, Fill&& fill) {
  if (const Ref<Object> cached = chart._accessibilityValueForKey(StorageKeyChildren.get()))
    return cast<Array>(cached);
  const Ref<MutableArray> elements = make<MutableArray>();
  chart._accessibilitySetRetainedValueForKey(elements, StorageKeyChildren.get());
  std::forward<Fill>(fill)(*elements);
  chart._accessibilitySetRetainedValueForKey(elements, StorageKeyChildren.get());
  return elements;
}

// One bar: the frame is in the chart's own space. Without a value it has only its label.
Ref<AccessibilityElement> chartElement(Object& chart, Rect frame, Ref<String> label, Ref<String> value);

inline bool isAxis(std::int64_t axis) {
  return axis == horizontalAxis || axis == verticalAxis;
}

// The text of an axis by its key in the string table; nil for what is none and for an empty key.
Ref<String> localizedTextForAxis(std::int64_t axis, std::string_view horizontal, std::string_view vertical);

// The x of every boxed point, or the y, as doubles in the points' order; an empty list for what is no axis
// and without graph data. What is no point counts as the zero point.
Ref<Array> pointValuesForAxis(const Ref<Array>& graphData, std::int64_t axis);

}  // namespace ax
