#include "platform/runtime/Value.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Value::staticClass() {
  static Class& result = ClassBuilder<Value>("Value", Object::staticClass()).build();
  return result;
}

bool Value::isEqual(const Object& other) const {
  const Value* value = cast<Value>(&other);
  return value != nullptr && value->content_ == content_;
}

static const RegisteredClass<Value> registered;

}  // namespace ax
