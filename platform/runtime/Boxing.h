#pragma once

#include <cstdint>
#include <functional>
#include <string_view>

#include "platform/runtime/Geometry.h"
#include "platform/runtime/Object.h"

namespace ax {

class Class;

// Scalars as objects: Number for numbers and booleans, Value for geometry and selectors. Blocks cannot be
// boxed; they arrive as nil.
Ref<Object> box(bool value);
Ref<Object> box(std::int32_t value);
Ref<Object> box(std::int64_t value);
Ref<Object> box(std::uint32_t value);
Ref<Object> box(std::uint64_t value);
Ref<Object> box(float value);
Ref<Object> box(double value);
Ref<Object> box(Point value);
Ref<Object> box(Size value);
Ref<Object> box(Rect value);
Ref<Object> box(Insets value);
Ref<Object> box(Selector value);
Ref<Object> box(const Class* value);
template <class T>
Ref<Object> box(const Ref<T>& value) {
  return value;
}
template <class F>
Ref<Object> box(const std::function<F>&) {
  return nullptr;
}

// One row per type that a message or a member may carry: its type code and how it comes out of a box. A
// wrong kind of box reads as NO, 0 or the empty value.
template <class T>
struct Boxed;

template <class T>
T unbox(const Ref<Object>& object) {
  return Boxed<T>::open(object);
}
template <class T>
constexpr std::string_view encodingOf() {
  return Boxed<T>::encoding;
}
template <>
constexpr std::string_view encodingOf<void>() {
  return "v";
}

bool unboxBool(const Ref<Object>& object);
std::int64_t unboxInt(const Ref<Object>& object);
std::uint64_t unboxUnsigned(const Ref<Object>& object);
double unboxDouble(const Ref<Object>& object);
Point unboxPoint(const Ref<Object>& object);
Size unboxSize(const Ref<Object>& object);
Rect unboxRect(const Ref<Object>& object);
Insets unboxInsets(const Ref<Object>& object);
Selector unboxSelector(const Ref<Object>& object);
const Class* unboxClass(const Ref<Object>& object);

bool isNumber(const Object& object);
// Whether the object is the box of such a piece of geometry, or of a selector.
template <class T>
bool isValueOf(const Object& object);

template <class T, auto Open, char Code>
struct BoxedNumber {
  static constexpr char code[] = {Code, '\0'};
  static constexpr std::string_view encoding = {code, 1};
  static T open(const Ref<Object>& object) { return static_cast<T>(Open(object)); }
  static bool holds(const Object& object) { return isNumber(object); }
};
template <>
struct Boxed<bool> : BoxedNumber<bool, unboxBool, 'B'> {};
template <>
struct Boxed<std::int32_t> : BoxedNumber<std::int32_t, unboxInt, 'i'> {};
template <>
struct Boxed<std::int64_t> : BoxedNumber<std::int64_t, unboxInt, 'q'> {};
template <>
struct Boxed<std::uint32_t> : BoxedNumber<std::uint32_t, unboxUnsigned, 'I'> {};
template <>
struct Boxed<std::uint64_t> : BoxedNumber<std::uint64_t, unboxUnsigned, 'Q'> {};
template <>
struct Boxed<float> : BoxedNumber<float, unboxDouble, 'f'> {};
template <>
struct Boxed<double> : BoxedNumber<double, unboxDouble, 'd'> {};

template <class T, auto Open>
struct BoxedValue {
  static T open(const Ref<Object>& object) { return Open(object); }
  static bool holds(const Object& object) { return isValueOf<T>(object); }
};
template <>
struct Boxed<Selector> : BoxedValue<Selector, unboxSelector> {
  static constexpr std::string_view encoding = ":";
};
template <>
struct Boxed<Point> : BoxedValue<Point, unboxPoint> {
  static constexpr std::string_view encoding = "{Point=dd}";
};
template <>
struct Boxed<Size> : BoxedValue<Size, unboxSize> {
  static constexpr std::string_view encoding = "{Size=dd}";
};
template <>
struct Boxed<Rect> : BoxedValue<Rect, unboxRect> {
  static constexpr std::string_view encoding = "{Rect={Point=dd}{Size=dd}}";
};
template <>
struct Boxed<Insets> : BoxedValue<Insets, unboxInsets> {
  static constexpr std::string_view encoding = "{Insets=dddd}";
};
template <>
struct Boxed<const Class*> {
  static constexpr std::string_view encoding = "#";
  static const Class* open(const Ref<Object>& object) { return unboxClass(object); }
  static bool holds(const Object& object) {
    return unboxClass(Ref<Object>(const_cast<Object*>(&object))) != nullptr;
  }
};
template <class F>
struct Boxed<std::function<F>> {
  static constexpr std::string_view encoding = "@?";
  static std::function<F> open(const Ref<Object>&) { return {}; }
  static bool holds(const Object&) { return false; }
};
template <class T>
struct Boxed<Ref<T>> {
  static constexpr std::string_view encoding = "@";
  static Ref<T> open(const Ref<Object>& object) { return cast<T>(object); }
};

inline constexpr std::string_view rectEncoding = Boxed<Rect>::encoding;

}  // namespace ax
