#include "platform/health/HealthStore.h"

#include <atomic>

#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {
std::atomic<std::size_t> queries = 0;
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
  const WheelchairUse use = storedWheelchairUse();
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
