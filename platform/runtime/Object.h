#pragma once

#include <atomic>
#include <cstdint>
#include <string>

#include "platform/runtime/Precondition.h"
#include "platform/runtime/Ref.h"
#include "platform/runtime/Selector.h"

namespace ax {

class Class;
class Object;

// One value attached to an object: under an interned name, or under the address of a private key.
struct Attachment {
  Attachment* next;
  const void* key;
  Object* value;  // retained
};

// The root of everything that is reached by name. An object knows its class, counts its handles and keeps
// what others attach to it; it ends with its last handle. Objects are made with make<T>() and belong to the
// thread that made them.
class Object {
 public:
  Object() = default;
  Object(const Object&) = delete;
  Object& operator=(const Object&) = delete;
  virtual ~Object();

  static Class& staticClass();

  const Class& isa() const {
    if (checksPreconditions && isa_ == nullptr) [[unlikely]] {
      preconditionFailed(
          "an object has its class once make<T>() returns: send nothing to it from its constructor",
          SourcePlace::current());
    }
    return *isa_;
  }
  bool isKindOf(const Class& other) const;
  // False for nil: nothing is kind of a class that does not exist.
  bool isKindOf(const Class* other) const { return other != nullptr && isKindOf(*other); }

  // Equality of content; identity unless a class says otherwise.
  virtual bool isEqual(const Object& other) const { return this == &other; }
  // The text form, used where an object fills a place in a text.
  virtual std::string description() const;
  // What is kept where a copy is asked for: the object itself, unless its content can change.
  virtual Ref<Object> copy() { return Ref<Object>(this); }

  // Values under constant names. Storing nil removes the entry. The value is retained until then, or until
  // the object ends.
  Ref<Object> _accessibilityValueForKey(Key key) const { return attachedValue(key.record()); }
  void _accessibilitySetRetainedValueForKey(Ref<Object> value, Key key) {
    attach(key.record(), std::move(value));
  }

  // The guarded reads: see KeyReading.h for what they share.
  Ref<Object> safeValueForKey(Key key) const;
  Ref<Object> safeValueForKey(std::string_view key) const { return safeValueForKey(Selector::find(key)); }
  Ref<Object> safeValueForKeyPath(std::string_view dottedKeys) const;
  bool safeBoolForKey(Key key) const;
  std::int64_t safeIntForKey(Key key) const;
  double safeDoubleForKey(Key key) const;

  bool hasAttachments() const { return attachments_ != nullptr; }
  // The attached value under a key's address, not retained; nil when there is none.
  Object* attached(const void* key) const {
    for (const Attachment* a = attachments_; a != nullptr; a = a->next) {
      if (a->key == key) return a->value;
    }
    return nullptr;
  }
  Ref<Object> attachedValue(const void* key) const { return Ref<Object>(attached(key)); }
  void attach(const void* key, Ref<Object> value);

  // Whether its last handle is gone. What is attached to it ends first, while the object itself is whole and
  // answers; then its destructors run. Handles may be made meanwhile and must be gone when it is over; weak
  // ones are nil.
  bool isEnding() const { return count_ >= ending; }

  void retain() const { ++count_; }
  void release() const {
    if (--count_ == 0) const_cast<Object*>(this)->end();
  }

 private:
  friend class Class;
  template <class T, class... Arguments>
  friend Ref<T> make(Arguments&&... arguments);

  // Handles made of an object that ends come and go without ending it once more.
  static constexpr std::uint32_t ending = 1u << 31;

  void end();
  void endAttachments();

  const Class* isa_ = nullptr;
  Attachment* attachments_ = nullptr;
  mutable std::uint32_t count_ = 1;
};

// The class of a C++ type, asked for once.
template <class T>
const Class& classOf() {
  static std::atomic<const Class*> known = nullptr;
  const Class* result = known.load(std::memory_order_relaxed);
  if (result == nullptr) known.store(result = &T::staticClass(), std::memory_order_release);
  return *result;
}

// Makes an object of a C++ class, with the class that it registered under its name.
template <class T, class... Arguments>
Ref<T> make(Arguments&&... arguments) {
  T* object = new T(std::forward<Arguments>(arguments)...);
  object->isa_ = &classOf<T>();
  return Ref<T>::adopt(object);
}

// The object when it is one of T or of a class below it; else nil.
template <class T>
T* cast(Object* object) {
  if constexpr (std::is_same_v<T, Object>) {
    return object;
  } else {
    if (object == nullptr) return nullptr;
    const Class& wanted = classOf<T>();
    return &object->isa() == &wanted || object->isKindOf(wanted) ? static_cast<T*>(object) : nullptr;
  }
}

template <class T>
const T* cast(const Object* object) {
  return cast<T>(const_cast<Object*>(object));
}

template <class T>
Ref<T> cast(Ref<Object> object) {
  if constexpr (std::is_same_v<T, Object>) {
    return object;
  } else {
    T* result = cast<T>(object.get());
    return result == nullptr ? Ref<T>() : Ref<T>::adopt(static_cast<T*>(object.leak()));
  }
}

template <class T>
Ref<T> cast(const Ref<T>& object) {
  return object;
}

// Values under the address of a private static key, one key per stored property.
Ref<Object> getAssociatedObject(const Object& object, const void* staticKey);
void setAssociatedObject(Object& object, const void* staticKey, Ref<Object> value);
void setAssociatedCopiedObject(Object& object, const void* staticKey, const Ref<Object>& value);

}  // namespace ax
