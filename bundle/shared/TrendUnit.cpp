#include "bundle/shared/TrendUnit.h"

#include <array>

using namespace ax;

namespace {

Ref<Unit> oxygenUptake() {
  return Unit::literUnitWithMetricPrefix(MetricPrefix::milli)
      ->unitDividedByUnit(*Unit::gramUnitWithMetricPrefix(MetricPrefix::kilo))
      ->unitDividedByUnit(*Unit::minuteUnit());
}

Ref<Unit> kilometersPerHour() {
  return Unit::meterUnitWithMetricPrefix(MetricPrefix::kilo)->unitDividedByUnit(*Unit::hourUnit());
}

constexpr std::array<Ref<Unit> (*)(), 9> unitsByTrendType = {
    &Unit::kilocalorieUnit, &Unit::minuteUnit, &Unit::countUnit,   &Unit::meterUnit,   &Unit::countUnit,
    &Unit::countUnit,       &oxygenUptake,     &kilometersPerHour, &kilometersPerHour,
};

}  // namespace

Ref<Unit> accessibilityQSUnitForTrendType(std::uint64_t type) {
  return type < unitsByTrendType.size() ? unitsByTrendType[type]() : nullptr;
}
