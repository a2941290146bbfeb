#include "platform/runtime/Number.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <utility>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

template <class Integer>
Integer clamped(double value) {
  using Limits = std::numeric_limits<Integer>;
  if (std::isnan(value)) return 0;
  if (value <= static_cast<double>(Limits::min())) return Limits::min();
  if (value >= static_cast<double>(Limits::max())) return Limits::max();
  return static_cast<Integer>(value);
}

template <class Integer, class Other>
Integer clampedInteger(Other value) {
  using Limits = std::numeric_limits<Integer>;
  if (std::cmp_less(value, Limits::min())) return Limits::min();
  if (std::cmp_greater(value, Limits::max())) return Limits::max();
  return static_cast<Integer>(value);
}

template <class Integer>
Integer as(const Number::Content& content) {
  return std::visit(
      [](auto value) -> Integer {
        if constexpr (std::is_floating_point_v<decltype(value)>) {
          return clamped<Integer>(value);
        } else {
          return clampedInteger<Integer>(std::common_type_t<decltype(value), int>(value));
        }
      },
      content);
}

bool isWhole(const Number::Content& content) {
  return std::visit([](auto value) { return !std::is_floating_point_v<decltype(value)>; }, content);
}

}  // namespace

Class& Number::staticClass() {
  static Class& result = ClassBuilder<Number>("Number", Object::staticClass())
                             .method<&Number::boolValue>("boolValue")
                             .method<&Number::intValue>("intValue")
                             .method<&Number::doubleValue>("doubleValue")
                             .build();
  return result;
}

bool Number::boolValue() const {
  return doubleValue() != 0;
}
std::int32_t Number::intValue() const {
  return as<std::int32_t>(content_);
}
std::int64_t Number::int64Value() const {
  return as<std::int64_t>(content_);
}
std::uint64_t Number::unsignedValue() const {
  return as<std::uint64_t>(content_);
}

double Number::doubleValue() const {
  return std::visit([](auto value) { return static_cast<double>(value); }, content_);
}

bool Number::isEqual(const Object& other) const {
  const Number* number = cast<Number>(&other);
  if (number == nullptr || number->doubleValue() != doubleValue()) return false;
  if (!isWhole(content_) || !isWhole(number->content_)) return true;
  return number->int64Value() == int64Value() && number->unsignedValue() == unsignedValue();
}

std::string Number::description() const {
  char text[32];
  const auto end = std::visit(
      [&](auto value) {
        if constexpr (std::is_same_v<decltype(value), bool>) {
          return std::to_chars(text, text + sizeof text, static_cast<int>(value)).ptr;
        } else {
          return std::to_chars(text, text + sizeof text, value).ptr;
        }
      },
      content_);
  return {text, end};
}

static const RegisteredClass<Number> registered;

}  // namespace ax
