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
double unboxDouble(const Ref<Object>& object);
Point unboxPoint(const Ref<Object>& object);
Size unboxSize(const Ref<Object>& object);
Rect unboxRect(const Ref<Object>& object);
Insets unboxInsets(const Ref<Object>& object);
Selector unboxSelector(const Ref<Object>& object);
const Class* unboxClass(const Ref<Object>& object);

template <auto Open, char... Code>
struct BoxedAs {
  static constexpr char code[] = {Code..., '\0'};
  static constexpr std::string_view encoding = {code, sizeof...(Code)};
  static auto open(const Ref<Object>& object) { return Open(object); }
};
template <>
struct Boxed<bool> : BoxedAs<unboxBool, 'B'> {};
template <>
struct Boxed<std::int32_t> : BoxedAs<unboxInt, 'i'> {
  static std::int32_t open(const Ref<Object>& object) { return static_cast<std::int32_t>(unboxInt(object)); }
};
template <>
struct Boxed<std::int64_t> : BoxedAs<unboxInt, 'q'> {};
template <>
struct Boxed<std::uint32_t> : BoxedAs<unboxInt, 'I'> {
  static std::uint32_t open(const Ref<Object>& object) {
    return static_cast<std::uint32_t>(unboxInt(object));
  }
};
template <>
struct Boxed<std::uint64_t> : BoxedAs<unboxInt, 'Q'> {
  static std::uint64_t open(const Ref<Object>& object) {
    return static_cast<std::uint64_t>(unboxInt(object));
  }
};
template <>
struct Boxed<float> : BoxedAs<unboxDouble, 'f'> {
  static float open(const Ref<Object>& object) { return static_cast<float>(unboxDouble(object)); }
};
template <>
struct Boxed<double> : BoxedAs<unboxDouble, 'd'> {};
template <>
struct Boxed<Selector> : BoxedAs<unboxSelector, ':'> {};
template <>
struct Boxed<const Class*> : BoxedAs<unboxClass, '#'> {};
template <>
struct Boxed<Point> {
  static constexpr std::string_view encoding = "{Point=dd}";
  static Point open(const Ref<Object>& object) { return unboxPoint(object); }
};
template <>
struct Boxed<Size> {
  static constexpr std::string_view encoding = "{Size=dd}";
  static Size open(const Ref<Object>& object) { return unboxSize(object); }
};
template <>
struct Boxed<Rect> {
  static constexpr std::string_view encoding = "{Rect={Point=dd}{Size=dd}}";
  static Rect open(const Ref<Object>& object) { return unboxRect(object); }
};
template <>
struct Boxed<Insets> {
  static constexpr std::string_view encoding = "{Insets=dddd}";
  static Insets open(const Ref<Object>& object) { return unboxInsets(object); }
};
template <class F>
struct Boxed<std::function<F>> {
  static constexpr std::string_view encoding = "@?";
  static std::function<F> open(const Ref<Object>&) { return {}; }
};
template <class T>
struct Boxed<Ref<T>> {
  static constexpr std::string_view encoding = "@";
  static Ref<T> open(const Ref<Object>& object) { return cast<T>(object); }
};

inline constexpr std::string_view rectEncoding = Boxed<Rect>::encoding;

}  // namespace ax
