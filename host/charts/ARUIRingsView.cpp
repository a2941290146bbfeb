#include "host/charts/ARUIRingsView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ARUIRingsView::staticClass() {
  static Class& result = ClassBuilder<ARUIRingsView>("ARUIRingsView", View::staticClass()).build();
  return result;
}

static const RegisteredClass<ARUIRingsView> registered;

}  // namespace ax::host
