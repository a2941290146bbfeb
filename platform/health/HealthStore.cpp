#include "platform/health/HealthStore.h"

#include <atomic>
#include <mutex>

#include "platform/base/NeverDestroyed.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

std::atomic<std::size_t> queries = 0;

// A task may still ask while the process ends.
struct Answer {
  std::mutex mutex;
  std::function<WheelchairUse()> given;
};
Answer& answer() {
  static NeverDestroyed<Answer> shared;
  return *shared;
}

// It is asked without the lock: one that takes its time keeps nobody else waiting.
WheelchairUse answeredUse() {
  std::unique_lock lock(answer().mutex);
  const std::function<WheelchairUse()> given = answer().given;
  lock.unlock();
  return given ? given() : storedWheelchairUse();
}

}  // namespace

void setWheelchairAnswer(std::function<WheelchairUse()> given) {
  const std::lock_guard lock(answer().mutex);
  answer().given = std::move(given);
}

Class& WheelchairUseObject::staticClass() {
  static Class& result = ClassBuilder<WheelchairUseObject>("WheelchairUseObject", Object::staticClass())
                             .method<&WheelchairUseObject::wheelchairUse>("wheelchairUse")
                             .build();
  return result;
}

Class& HealthStore::staticClass() {
  static Class& result = ClassBuilder<HealthStore>("HealthStore", Object::staticClass()).build();
  return result;
}

Ref<WheelchairUseObject> HealthStore::wheelchairUseWithError(Ref<Object>& error) const {
  ++queries;
  const WheelchairUse use = answeredUse();
  if (use == WheelchairUse::error) {
    error = string("The health store does not answer.");
    return nullptr;
  }
  return make<WheelchairUseObject>(static_cast<std::int64_t>(use));
}

std::size_t wheelchairQueries() {
  return queries;
}

static const RegisteredClass<WheelchairUseObject> registeredUse;
static const RegisteredClass<HealthStore> registered;

}  // namespace ax
