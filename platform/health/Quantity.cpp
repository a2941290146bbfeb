#include "platform/health/Quantity.h"

#include "platform/foundation/Formatters.h"
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
  return unit && unit_ && unit->hasTextOf(*unit_) ? value_ : convertedTo(unit);
}

// Apart, so that a value in its own unit saves no registers for it.
[[gnu::noinline]] double Quantity::convertedTo(const Ref<Unit>& unit) const {
  return isCompatibleWithUnit(unit) ? value_ * unit_->factor() / unit->factor() : 0;
}

bool Quantity::isEqual(const Object& other) const {
  const Quantity* quantity = cast<Quantity>(&other);
  if (quantity == nullptr || quantity->value_ != value_) return false;
  return unit_ && quantity->unit_ ? unit_->isEqual(*quantity->unit_) : unit_ == quantity->unit_;
}

std::string Quantity::description() const {
  return stringWithFormat(string("{0, unit, 1}"),
                          {formatFloat(FloatFormat::twoDecimals, static_cast<float>(value_)), unit_})
      ->text();
}

static const RegisteredClass<Quantity> registered;

}  // namespace ax
