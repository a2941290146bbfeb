#include "platform/runtime/Boxing.h"

#include "platform/runtime/Class.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Value.h"

namespace ax {

Ref<Object> box(bool value) {
  return number(value);
}
Ref<Object> box(std::int32_t value) {
  return number(value);
}
Ref<Object> box(std::int64_t value) {
  return number(value);
}
Ref<Object> box(std::uint32_t value) {
  return number(value);
}
Ref<Object> box(std::uint64_t value) {
  return number(value);
}
Ref<Object> box(float value) {
  return number(value);
}
Ref<Object> box(double value) {
  return number(value);
}
Ref<Object> box(Point value) {
  return make<Value>(value);
}
Ref<Object> box(Size value) {
  return make<Value>(value);
}
Ref<Object> box(Rect value) {
  return make<Value>(value);
}
Ref<Object> box(Insets value) {
  return make<Value>(value);
}
Ref<Object> box(Selector value) {
  return value ? Ref<Object>(make<Value>(value)) : nullptr;
}
Ref<Object> box(const Class* value) {
  return Ref<Object>(const_cast<Class*>(value));
}

namespace {

template <class T>
T unboxValue(const Ref<Object>& object) {
  const Value* value = cast<Value>(object.get());
  return value == nullptr ? T() : value->get<T>();
}

}  // namespace

bool unboxBool(const Ref<Object>& object) {
  const Number* number = cast<Number>(object.get());
  return number != nullptr && number->boolValue();
}

std::int64_t unboxInt(const Ref<Object>& object) {
  const Number* number = cast<Number>(object.get());
  return number == nullptr ? 0 : number->int64Value();
}

std::uint64_t unboxUnsigned(const Ref<Object>& object) {
  const Number* number = cast<Number>(object.get());
  return number == nullptr ? 0 : number->unsignedValue();
}

double unboxDouble(const Ref<Object>& object) {
  const Number* number = cast<Number>(object.get());
  return number == nullptr ? 0 : number->doubleValue();
}

Point unboxPoint(const Ref<Object>& object) {
  return unboxValue<Point>(object);
}
Size unboxSize(const Ref<Object>& object) {
  return unboxValue<Size>(object);
}
Rect unboxRect(const Ref<Object>& object) {
  return unboxValue<Rect>(object);
}
Insets unboxInsets(const Ref<Object>& object) {
  return unboxValue<Insets>(object);
}
Selector unboxSelector(const Ref<Object>& object) {
  return unboxValue<Selector>(object);
}
const Class* unboxClass(const Ref<Object>& object) {
  return cast<Class>(object.get());
}

bool isNumber(const Object& object) {
  return object.isKindOf(Number::staticClass());
}

template <class T>
bool isValueOf(const Object& object) {
  const Value* value = cast<Value>(&object);
  return value != nullptr && std::holds_alternative<T>(value->content());
}
template bool isValueOf<Point>(const Object&);
template bool isValueOf<Size>(const Object&);
template bool isValueOf<Rect>(const Object&);
template bool isValueOf<Insets>(const Object&);
template bool isValueOf<Selector>(const Object&);

}  // namespace ax
