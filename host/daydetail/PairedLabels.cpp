#include "host/daydetail/PairedLabels.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& PairedLabels::staticClass() {
  using T = PairedLabels;
  static Class& result = ClassBuilder<T>("_PairedLabels", View::staticClass())
                             .property<&T::keyLabel, &T::setKeyLabel>("keyLabel")
                             .property<&T::valueLabel, &T::setValueLabel>("valueLabel")
                             .build();
  return result;
}

void PairedLabels::layoutSubviews() {
  addUnplaced(*this, {keyLabel_, valueLabel_});
}

static const RegisteredClass<PairedLabels> registered;

}  // namespace ax::host
