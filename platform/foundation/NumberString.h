#pragma once

#include "platform/formatting/Numbers.h"
#include "platform/foundation/String.h"

namespace ax {

// A number as text that knows what it says of plural forms: filled into a pattern, what stands beside it
// agrees with it. Every function that writes a number makes one.
class NumberString final : public String {
 public:
  static Class& staticClass();

  explicit NumberString(formatting::NumberText number) : String(number.text), number_(std::move(number)) {}

  const formatting::NumberText& number() const { return number_; }

 private:
  formatting::NumberText number_;
};

}  // namespace ax
