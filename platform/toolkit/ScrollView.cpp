#include "platform/toolkit/ScrollView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

Insets visibleContentInset(ScrollView& view) {
  return _accessibilityVisibleContentInset(view);
}
void setVisibleContentInset(ScrollView& view, Insets insets) {
  _accessibilitySetVisibleContentInset(view, insets);
}

}  // namespace

Class& ScrollView::staticClass() {
  static Class& result =
      ClassBuilder<ScrollView>("ScrollView", View::staticClass())
          .property<&ScrollView::contentOffset, &ScrollView::setContentOffset>("contentOffset")
          .property<&ScrollView::contentSize, &ScrollView::setContentSize>("contentSize")
          .method<&visibleContentInset>("_accessibilityVisibleContentInset")
          .method<&setVisibleContentInset>("_accessibilitySetVisibleContentInset:")
          .build();
  return result;
}

static const RegisteredClass<ScrollView> registered;

}  // namespace ax
