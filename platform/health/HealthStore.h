#pragma once

#include "platform/foundation/String.h"

namespace ax {

// The store's answer to a question about wheelchair use, a WheelchairUse.
class WheelchairUseObject final : public Object {
 public:
  static Class& staticClass();

  explicit WheelchairUseObject(std::int64_t use) : use_(use) {}
  std::int64_t wheelchairUse() const { return use_; }

 private:
  std::int64_t use_;
};

// The way to the user's health data. A store may be made and asked on any thread; it stays on that thread.
class HealthStore final : public Object {
 public:
  static Class& staticClass();

  // Nil, with `error` set, when the store cannot say.
  Ref<WheelchairUseObject> wheelchairUseWithError(Ref<Object>& error) const;
};

// How many wheelchair queries all stores of the process have answered.
std::size_t wheelchairQueries();

}  // namespace ax
