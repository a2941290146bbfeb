#pragma once

#include <cstddef>
#include <type_traits>
#include <utility>

#include "platform/runtime/Precondition.h"

namespace ax {

// A strong handle to an Object, or nil. Copying it keeps the object alive; the count is not atomic, so a
// handle and its copies stay on one thread, the main thread for every host object.
template <class T>
class Ref {
 public:
  using Target = T;

  Ref() = default;
  Ref(std::nullptr_t) {}
  explicit Ref(T* object) : object_(object) { retain(); }
  Ref(const Ref& other) : object_(other.object_) { retain(); }
  Ref(Ref&& other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
  template <class U>
  requires std::is_convertible_v<U*, T*> Ref(const Ref<U>& other) : object_(other.get()) { retain(); }
  template <class U>
  requires std::is_convertible_v<U*, T*> Ref(Ref<U>&& other)
  noexcept : object_(other.leak()) {}
  ~Ref() {
    if (object_ != nullptr) object_->release();
  }

  Ref& operator=(Ref other) noexcept {
    std::swap(object_, other.object_);
    return *this;
  }

  // Takes over a count that the caller already holds.
  static Ref adopt(T* object) {
    Ref result;
    result.object_ = object;
    return result;
  }

  // Gives the count away: the caller must release it.
  [[nodiscard]] T* leak() { return std::exchange(object_, nullptr); }

  T* get() const { return object_; }
  T* operator->() const { return &**this; }
  T& operator*() const {
    if (checksPreconditions && object_ == nullptr) [[unlikely]]
      preconditionFailed("the handle is nil: test it, or send a message, which nil answers too",
                         SourcePlace::current());
    // Optimised builds check nothing.
    // NOLINTNEXTLINE(clang-analyzer-core.uninitialized.UndefReturn)
    return *object_;
  }
  explicit operator bool() const { return object_ != nullptr; }

  // Identity, not equality of content.
  template <class U>
  bool operator==(const Ref<U>& other) const {
    return object_ == other.get();
  }
  bool operator==(std::nullptr_t) const { return object_ == nullptr; }

 private:
  void retain() {
    if (object_ != nullptr) object_->retain();
  }

  T* object_ = nullptr;
};

}  // namespace ax
