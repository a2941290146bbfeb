#include "host/achievements/ODUIBadgeView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ODUIBadgeView::staticClass() {
  static Class& result = ClassBuilder<ODUIBadgeView>("ODUIBadgeView", View::staticClass())
                             .property<&ODUIBadgeView::image, &ODUIBadgeView::setImage>("image")
                             .build();
  return result;
}

static const RegisteredClass<ODUIBadgeView> registered;

}  // namespace ax::host
