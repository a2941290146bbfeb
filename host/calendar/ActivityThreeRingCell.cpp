#include "host/calendar/ActivityThreeRingCell.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ActivityThreeRingCell::staticClass() {
  using T = ActivityThreeRingCell;
  static Class& result = ClassBuilder<T>("ActivityThreeRingCell", CollectionViewCell::staticClass())
                             .instanceVariable<&T::dateLabel_>("_dateLabel")
                             .instanceVariable<&T::date_>("_date")
                             .build();
  return result;
}

void ActivityThreeRingCell::layoutSubviews() {
  constexpr double labelHeight = 20;
  addUnplaced(*this, dateLabel_, {0, frame().height - labelHeight, frame().width, labelHeight});
}

static const RegisteredClass<ActivityThreeRingCell> registered;

}  // namespace ax::host
