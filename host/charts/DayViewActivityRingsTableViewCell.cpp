#include "host/charts/DayViewActivityRingsTableViewCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& DayViewActivityRingsTableViewCell::staticClass() {
  using T = DayViewActivityRingsTableViewCell;
  static Class& result =
      ClassBuilder<T>("Velto.DayViewActivityRingsTableViewCell", TableViewCell::staticClass())
          .instanceVariable<&T::ringsView_>("_ringsView")
          .build();
  return result;
}

void DayViewActivityRingsTableViewCell::layoutSubviews() {
  stackIn(*contentView(), {ringsView_});
}

static const RegisteredClass<DayViewActivityRingsTableViewCell> registered;

}  // namespace ax::host
