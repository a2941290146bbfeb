#pragma once

#include "platform/health/Unit.h"

namespace ax {

// An amount in a unit. Without a unit it is an amount of nothing: 0 in every unit.
class Quantity final : public Object {
 public:
  static Class& staticClass();

  Quantity(double value, Ref<Unit> unit) : value_(value), unit_(std::move(unit)) {}

  double value() const { return value_; }
  const Ref<Unit>& unit() const { return unit_; }
  bool isCompatibleWithUnit(const Ref<Unit>& unit) const;
  // 0 in no unit, and in one that measures something else.
  double doubleValueForUnit(const Ref<Unit>& unit) const;

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 private:
  double convertedTo(const Ref<Unit>& unit) const;

  double value_;
  Ref<Unit> unit_;
};

inline Ref<Quantity> quantity(double value, Ref<Unit> unit) {
  return make<Quantity>(value, std::move(unit));
}

}  // namespace ax
