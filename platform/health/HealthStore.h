#pragma once

#include <functional>

#include "platform/foundation/Environment.h"
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

// What every store answers from now on in place of the environment's setting; it runs on the thread that
// asks, so it may take its time and must be safe to call on several threads at once. None gives the
// environment its say again. Any thread.
void setWheelchairAnswer(std::function<WheelchairUse()> answer);

// How many wheelchair queries all stores of the process have answered.
std::size_t wheelchairQueries();

}  // namespace ax
