#pragma once

#include "platform/foundation/Date.h"

namespace ax::host {

// The chart library's row of bars of one width.
class VLUIChartUniformBarSeries : public Object {
 public:
  static Class& staticClass();

 private:
  Ref<Date> minDate_;  // where the row begins
};

}  // namespace ax::host
