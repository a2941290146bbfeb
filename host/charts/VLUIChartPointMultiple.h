#pragma once

#include "platform/foundation/Date.h"

namespace ax::host {

// What a point spans on the vertical axis, both ends included.
class VLUIChartValueSpan : public Object {
 public:
  static Class& staticClass();

  VLUIChartValueSpan() = default;
  VLUIChartValueSpan(std::uint64_t first, std::uint64_t last) : firstIndex_(first), lastIndex_(last) {}

 private:
  std::uint64_t firstIndex_ = 0;
  std::uint64_t lastIndex_ = 0;
};

// A point of a chart that stands for several values at one time.
class VLUIChartPointMultiple : public Object {
 public:
  static Class& staticClass();

  VLUIChartPointMultiple() = default;
  VLUIChartPointMultiple(Ref<Date> x, Ref<VLUIChartValueSpan> y)
      : xValue_(std::move(x)), yValue_(std::move(y)) {}

 private:
  Ref<Date> xValue_;
  Ref<VLUIChartValueSpan> yValue_;
};

}  // namespace ax::host
