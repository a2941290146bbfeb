#pragma once

#include "platform/foundation/String.h"
#include "platform/runtime/Message.h"

namespace ax {

namespace messages {
// The pattern that says a number of something, "{0, plural, one {# mile} other {# miles}}"; nil for what is
// not counted. Whatever answers it agrees with the number when a pattern fills in both.
extern const Message<Ref<String>()> countedPattern;
}  // namespace messages

// The spoken name of a unit: a text of its own, and a pattern for numbers of it.
class UnitName final : public String {
 public:
  static Class& staticClass();

  UnitName(std::string name, Ref<String> countedPattern)
      : String(std::move(name)), countedPattern_(std::move(countedPattern)) {}

  Ref<String> countedPattern() const { return countedPattern_; }

 private:
  Ref<String> countedPattern_;
};

}  // namespace ax
