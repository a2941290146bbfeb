#pragma once

#include "platform/foundation/Array.h"
#include "platform/health/Unit.h"
#include "platform/toolkit/View.h"

namespace ax::host {

// The day's energy or minutes as small bars.
class ActivityQuantityChart : public View {
 public:
  static Class& staticClass();

 private:
  Ref<Array> dataPoints_;  // over the day, a quarter of an hour each
  Ref<Unit> preferredUnit_;
};

}  // namespace ax::host
