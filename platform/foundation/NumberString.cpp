#include "platform/foundation/NumberString.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& NumberString::staticClass() {
  static Class& result = ClassBuilder<NumberString>("NumberString", String::staticClass()).build();
  return result;
}

static const RegisteredClass<NumberString> registered;

}  // namespace ax
