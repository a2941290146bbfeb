#include "bundle/charts/GraphData.h"

#include "bundle/shared/LocalizedString.h"
#include "platform/runtime/Boxing.h"
#include "platform/runtime/Number.h"

namespace ax {

void refreshGraphData(Object& chart, const GraphSource& source) {
  Ref<Array> points = safeArrayForKey(chart, source.member);
  const bool isUsable = points && !points->isEmpty() && points->firstObject()->isKindOf(source.expected);
  chart._accessibilitySetRetainedValueForKey(isUsable ? points : nullptr, source.graphKey);
  chart._accessibilitySetRetainedValueForKey(nullptr, StorageKeyChildren.get());
}

Ref<AccessibilityElement> chartElement(Object& chart, Rect frame, Ref<String> label, Ref<String> value) {
  Ref<AccessibilityElement> element = AccessibilityElement::initWithAccessibilityContainer(chart);
  messages::setAccessibilityFrameInContainerSpace(element, frame);
  messages::setAccessibilityLabel(element, std::move(label));
  messages::setAccessibilityValue(element, std::move(value));
  return element;
}

Ref<String> localizedTextForAxis(std::int64_t axis, std::string_view horizontal, std::string_view vertical) {
  const std::string_view key = axis == horizontalAxis ? horizontal
                               : axis == verticalAxis ? vertical
                                                      : std::string_view();
  return key.empty() ? nullptr : accessibilityLocalizedString(key);
}

Ref<Array> pointValuesForAxis(const Ref<Array>& graphData, std::int64_t axis) {
  Array::Items values;
  if (graphData && isAxis(axis)) {
    values.reserve(graphData->count());
    for (const Ref<Object>& item : *graphData) {
      const Point point = unboxPoint(item);
      values.push_back(number(axis == horizontalAxis ? point.x : point.y));
    }
  }
  return array(std::move(values));
}

}  // namespace ax
