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

template <class Type>
class Message;

// A typed selector, declared once and used for sending, for registering and for calling super:
//
//   inline const Message<Ref<String>()> accessibilityLabel{"accessibilityLabel"};
//   Ref<String> label = accessibilityLabel(view);
//
// Sent to nil, to an object whose class lacks the message, or to one that registered it with another type,
// it yields nil, NO or 0. What a method raises passes through.
template <class R, class... A>
class Message<R(A...)> {
 public:
  explicit Message(std::string_view name)
      : selector_(Selector::intern(name)),
        signature_(&signatureOf<R, A...>()),
        result_(identityOf<std::remove_cvref_t<R>>()),
        place_(Class::placeOf(selector_)) {}

  Selector selector() const { return selector_; }
  const Signature& signature() const { return *signature_; }

  R operator()(Receiver receiver, A... arguments) const {
    Object* object = receiver.get();
    if (object == nullptr) return R();
    return call(*object, object->isa().lookUp(selector_, place_), std::move(arguments)...);
  }

  // Calls one entry directly, as a call to super does. An entry without a function has no signature either.
  R call(Object& object, const Method& method, A... arguments) const {
    if (method.signature != signature_) [[unlikely]]
      return R();
    using Function = CanonicalType<R> (*)(Object&, const Method&, CanonicalType<A>...);
    const auto function = reinterpret_cast<Function>(method.function);
    if constexpr (std::is_same_v<R, CanonicalType<R>>) {
      return function(object, method, std::move(arguments)...);
    } else {
      Ref<Object> result = function(object, method, std::move(arguments)...);
      if (method.result != result_) [[unlikely]]
        return cast<typename R::Target>(std::move(result));
      return R::adopt(static_cast<typename R::Target*>(result.leak()));
    }
  }

 private:
  Selector selector_;
  const Signature* signature_;
  const void* result_;  // methods that return the same C++ type are believed
  std::size_t place_;   // the selector's, in the classes' tables
};

// Whether an object's class answers the message with the message's own type.
template <class Type>
bool respondsTo(const Object& object, const Message<Type>& message) {
  const Method& method = object.isa().lookUp(message.selector());
  return method.function != nullptr && method.signature == &message.signature();
}

}  // namespace ax
