#include "platform/foundation/UnitName.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

constinit const Message<Ref<String>()> messages::countedPattern{"countedPattern"};

Class& UnitName::staticClass() {
  static Class& result = ClassBuilder<UnitName>("UnitName", String::staticClass())
                             .method<&UnitName::countedPattern>("countedPattern")
                             .build();
  return result;
}

static const RegisteredClass<UnitName> registered;

}  // namespace ax
