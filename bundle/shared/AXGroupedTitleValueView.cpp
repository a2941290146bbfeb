#include "bundle/shared/AXGroupedTitleValueView.h"

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/SpokenText.h"

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
  if (titleView.get() == container.get()) titleView = nullptr;
  if (valueView.get() == container.get()) valueView = nullptr;
  return make<AXGroupedTitleValueView>(container, std::move(titleView), std::move(valueView));
}

bool AXGroupedTitleValueView::isAccessibilityElement() {
  return !isEmpty(accessibilityLabel()) && !isEmpty(accessibilityValue());
}

Ref<String> AXGroupedTitleValueView::accessibilityLabel() {
  return labelOfPart(*this, titleView_);
}
Ref<String> AXGroupedTitleValueView::accessibilityValue() {
  return labelOfPart(*this, valueView_);
}

namespace {
const RegisteredClass<AXGroupedTitleValueView> registered;
}

}  // namespace ax
