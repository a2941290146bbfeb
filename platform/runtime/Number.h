#pragma once

#include <variant>

#include "platform/runtime/Object.h"

namespace ax {

// A boxed number or boolean. It remembers the type it was made of and answers as any other: an integer out
// of a fraction is cut toward zero, and out of range or not a number it is the nearest there is, or 0.
class Number final : public Object {
 public:
  using Content = std::variant<bool, std::int32_t, std::int64_t, std::uint32_t, std::uint64_t, float, double>;
  static Class& staticClass();

  explicit Number(Content content) : content_(content) {}

  const Content& content() const { return content_; }
  bool boolValue() const;
  std::int32_t intValue() const;
  std::int64_t int64Value() const;
  std::uint64_t unsignedValue() const;
  float floatValue() const { return static_cast<float>(doubleValue()); }
  double doubleValue() const;

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 private:
  Content content_;
};

template <class T>
Ref<Number> number(T value) {
  return make<Number>(Number::Content(value));
}

}  // namespace ax
