#pragma once

#include <variant>

#include "platform/runtime/Geometry.h"
#include "platform/runtime/Object.h"

namespace ax {

// A boxed piece of geometry, or a boxed selector. Asked for another kind than it holds, it answers the zero
// one.
class Value final : public Object {
 public:
  using Content = std::variant<Point, Size, Rect, Insets, Selector>;
  static Class& staticClass();

  explicit Value(Content content) : content_(content) {}

  const Content& content() const { return content_; }
  template <class T>
  T get() const {
    const T* held = std::get_if<T>(&content_);
    return held == nullptr ? T() : *held;
  }
  Point pointValue() const { return get<Point>(); }

  bool isEqual(const Object& other) const override;

 private:
  Content content_;
};

inline Ref<Value> point(double x, double y) {
  return make<Value>(Point{x, y});
}

}  // namespace ax
