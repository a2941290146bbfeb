#pragma once

#include "platform/runtime/Object.h"

namespace ax {

// What weak handles share: one per object that somebody holds weakly.
class WeakLink final : public Object {
 public:
  static Class& staticClass();
  // Nil for an object that ends.
  static Ref<WeakLink> to(Object& target);

  Object* target = nullptr;  // nil once the object has ended
};

// A handle that does not keep its object alive and reads as nil when the object is gone.
template <class T>
class Weak {
 public:
  Weak() = default;
  Weak(std::nullptr_t) {}
  Weak(T* object) : link_(object == nullptr ? nullptr : WeakLink::to(*object)) {}
  Weak(T& object) : Weak(&object) {}
  template <class U>
  Weak(const Ref<U>& object) : Weak(static_cast<T*>(object.get())) {}

  T* get() const { return link_ ? static_cast<T*>(link_->target) : nullptr; }
  Ref<T> lock() const { return Ref<T>(get()); }
  explicit operator bool() const { return get() != nullptr; }

 private:
  Ref<WeakLink> link_;
};

}  // namespace ax
