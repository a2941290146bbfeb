#include "platform/health/Quantity.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Quantity::staticClass() {
  static Class& result = ClassBuilder<Quantity>("Quantity", Object::staticClass())
                             .method<&Quantity::doubleValueForUnit>("doubleValueForUnit:")
                             .method<&Quantity::isCompatibleWithUnit>("isCompatibleWithUnit:")
                             .build();
  return result;
}

bool Quantity::isCompatibleWithUnit(const Ref<Unit>& unit) const {
  return unit && unit_ && unit_->isCompatibleWithUnit(*unit);
}

double Quantity::doubleValueForUnit(const Ref<Unit>& unit) const {
  if (!isCompatibleWithUnit(unit)) return 0;
  return unit->isEqual(*unit_) ? value_ : value_ * unit_->factor() / unit->factor();
}

bool Quantity::isEqual(const Object& other) const {
  const Quantity* quantity = cast<Quantity>(const_cast<Object*>(&other));
  if (quantity == nullptr || quantity->value_ != value_) return false;
  return unit_ && quantity->unit_ ? unit_->isEqual(*quantity->unit_) : unit_ == quantity->unit_;
}

std::string Quantity::description() const {
  return std::to_string(value_) + (unit_ ? " " + unit_->text() : "");
}

static const RegisteredClass<Quantity> registered;

}  // namespace ax
