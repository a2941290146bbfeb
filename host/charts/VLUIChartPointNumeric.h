#pragma once

#include "platform/runtime/Object.h"

namespace ax::host {

// What the chart library draws at one place: a date and a number.
class VLUIChartPointNumeric : public Object {
 public:
  static Class& staticClass();

  const Ref<Object>& xValue() const { return xValue_; }
  void setXValue(Ref<Object> value) { xValue_ = std::move(value); }
  const Ref<Object>& yValue() const { return yValue_; }
  void setYValue(Ref<Object> value) { yValue_ = std::move(value); }

 private:
  Ref<Object> xValue_;
  Ref<Object> yValue_;
};

}  // namespace ax::host
