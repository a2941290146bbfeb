#pragma once

#include "platform/runtime/Class.h"
#include "platform/runtime/Signature.h"

namespace ax {

// Who a message goes to: an object or nil, from any kind of handle. Does not keep the object alive.
class Receiver {
 public:
  Receiver(std::nullptr_t) {}
  Receiver(Object* object) : object_(object) {}
  Receiver(Object& object) : object_(&object) {}
  template <class T>
  Receiver(const Ref<T>& object) : object_(object.get()) {}
  Object* get() const { return object_; }

 private:
  Object* object_ = nullptr;
};

// What a message is without its C++ type: constant data, to which the runtime adds its own at the first use,
// on whichever thread. Until then its selector is nil, which no entry in a class's table has.
class MessageRecord {
 public:
  Selector selector() const {
    const SelectorRecord* record = record_.load(std::memory_order_acquire);
    if (record == nullptr) [[unlikely]]
      return resolve();
    return Selector(record);
  }
  // Nil before the first use.
  Selector selectorIfUsed() const { return Selector(record_.load(std::memory_order_acquire)); }
  const Signature& signature() const {
    (void)selector();
    return *signature_.load(std::memory_order_relaxed);
  }

  MessageRecord(const MessageRecord&) = delete;
  MessageRecord& operator=(const MessageRecord&) = delete;

 protected:
  constexpr MessageRecord(std::string_view name, const Signature& (*makeSignature)(),
                          const void* (*findResult)())
      : name_(name), makeSignature_(makeSignature), findResult_(findResult) {}

  const Method& answerOf(const Object& object) const {
    const Selector selector = selectorIfUsed();
    const Method& first = object.isa().firstAnswer(place_.load(std::memory_order_relaxed));
    return first.selector == selector ? first : answerSlowly(object);
  }
  bool hasTypeOf(const Method& method) const {
    if (method.signature == signature_.load(std::memory_order_relaxed)) [[likely]]
      return true;
    return hasTypeOnceResolved(method);
  }
  const void* result() const { return result_.load(std::memory_order_relaxed); }

 private:
  static constexpr Signature unresolved = {};

  Selector resolve() const;
  const Method& answerSlowly(const Object& object) const;
  bool hasTypeOnceResolved(const Method& method) const;

  std::string_view name_;
  const Signature& (*makeSignature_)();
  const void* (*findResult_)();
  // Published with the record, the last of them.
  mutable std::atomic<const SelectorRecord*> record_ = nullptr;
  mutable std::atomic<const Signature*> signature_ = &unresolved;
  mutable std::atomic<const void*> result_ = nullptr;  // methods that return the same C++ type are believed
  mutable std::atomic<std::size_t> place_ = 0;         // the selector's, in the classes' tables
};

template <class Type>
class Message;

// A typed selector, declared once and used for sending, for registering and for calling super:
//
//   inline constinit const Message<Ref<String>()> accessibilityLabel{"accessibilityLabel"};
//   Ref<String> label = accessibilityLabel(view);
//
// Sent to nil, to an object whose class lacks the message, or to one that registered it with another type,
// it yields nil, NO or 0. What a method raises passes through. The name must outlive the message.
template <class R, class... A>
class Message<R(A...)> : public MessageRecord {
 public:
  constexpr explicit Message(std::string_view name)
      : MessageRecord(name, &signatureOf<R, A...>, &identityOf<std::remove_cvref_t<R>>) {}

  R operator()(Receiver receiver, A... arguments) const {
    Object* object = receiver.get();
    if (object == nullptr) return R();
    return call(*object, answerOf(*object), std::move(arguments)...);
  }

  // Calls one entry directly, as a call to super does. An entry without a function has no signature either.
  R call(Object& object, const Method& method, A... arguments) const {
    if (!hasTypeOf(method)) [[unlikely]]
      return R();
    using Function = CanonicalType<R> (*)(Object&, const Method&, CanonicalType<A>...);
    const auto function = reinterpret_cast<Function>(method.function);
    if constexpr (std::is_same_v<R, CanonicalType<R>>) {
      return function(object, method, std::move(arguments)...);
    } else {
      Ref<Object> found = function(object, method, std::move(arguments)...);
      if (method.result != result()) [[unlikely]]
        return cast<typename R::Target>(std::move(found));
      return R::adopt(static_cast<typename R::Target*>(found.leak()));
    }
  }
};

// Whether an object's class answers the message with the message's own type.
template <class Type>
bool respondsTo(const Object& object, const Message<Type>& message) {
  const Method& method = object.isa().lookUp(message.selector());
  return method.function != nullptr && method.signature == &message.signature();
}

}  // namespace ax
