#include "bench/Comparison.h"

#include "bench/Sides.h"

namespace bench {

namespace {

double timingOf(const std::string& operation, const char* side) {
  for (const Timing& timing : timingsOf(operation)) {
    if (timing.name == side) return timing.nanoseconds;
  }
  return 0;
}

std::optional<double> boundTo(const std::string& side, const Operation& operation) {
  for (const Bound& bound : operation.bounds) {
    if (bound.side == side) return bound.ratio;
  }
  return std::nullopt;
}

double growthOf(const Growth& growth, const char* side) {
  return timingOf(growth.large, side) / timingOf(growth.small, side);
}

}  // namespace

void compare(const Operation& operation, std::vector<Row>& rows) {
  const double ours = timingOf(operation.name, "ours");
  for (const Timing& timing : timingsOf(operation.name)) {
    if (timing.name == "ours") continue;
    rows.push_back(
        {operation.title, "ns", ours, timing.name, timing.nanoseconds, boundTo(timing.name, operation)});
  }
}

void compareGrowth(const Growth& growth, std::vector<Row>& rows) {
  rows.push_back({growth.title, "x", growthOf(growth, "ours"), "floor's growth", growthOf(growth, "floor"),
                  growth.bound});
}

}  // namespace bench
