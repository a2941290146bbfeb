#include "bundle/shared/AXGroupedTitleValueView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& AXGroupedTitleValueView::staticClass() {
  using T = AXGroupedTitleValueView;
  static Class& result = ClassBuilder<T>("AXGroupedTitleValueView", AggregateElement::staticClass())
                             .instanceVariable<&T::titleView_>("_titleView")
                             .instanceVariable<&T::valueView_>("_valueView")
                             .method<&T::isAccessibilityElement>("isAccessibilityElement")
                             .method<&T::accessibilityLabel>("accessibilityLabel")
                             .method<&T::accessibilityValue>("accessibilityValue")
                             .build();
  return result;
}

AXGroupedTitleValueView::AXGroupedTitleValueView(Receiver container, Ref<Object> titleView,
                                                 Ref<Object> valueView)
    : AggregateElement(container, axArrayByIgnoringNilElementsWithCount(2, {titleView, valueView})),
      titleView_(std::move(titleView)),
      valueView_(std::move(valueView)) {}

Ref<AXGroupedTitleValueView> AXGroupedTitleValueView::initWithAccessibilityContainerTitleViewValueView(
    Receiver container, Ref<Object> titleView, Ref<Object> valueView) {
  return make<AXGroupedTitleValueView>(container, std::move(titleView), std::move(valueView));
}

bool AXGroupedTitleValueView::isAccessibilityElement() {
  return !isEmpty(messages::accessibilityLabel(titleView_)) &&
         !isEmpty(messages::accessibilityLabel(valueView_));
}

Ref<String> AXGroupedTitleValueView::accessibilityLabel() {
  return messages::accessibilityLabel(titleView_);
}
Ref<String> AXGroupedTitleValueView::accessibilityValue() {
  return messages::accessibilityLabel(valueView_);
}

namespace {
const RegisteredClass<AXGroupedTitleValueView> registered;
}

}  // namespace ax
