#pragma once

#include "platform/runtime/Message.h"

namespace ax {

// A message's answer, where what the receiver raises counts as nil, NO or 0, as in a guarded read.
template <class R, class... A>
R safeAnswer(const Message<R(A...)>& message, Receiver receiver, std::type_identity_t<A>... arguments) {
  try {
    return message(receiver, std::move(arguments)...);
  } catch (...) {
    return R();
  }
}

template <class Type>
class SafeMessage;

// A message to an object of the host whose answers are always taken so. Declared and sent like a Message.
template <class R, class... A>
class SafeMessage<R(A...)> {
 public:
  constexpr explicit SafeMessage(std::string_view name) : message_(name) {}

  R operator()(Receiver receiver, A... arguments) const {
    return safeAnswer(message_, receiver, std::move(arguments)...);
  }

 private:
  Message<R(A...)> message_;
};

}  // namespace ax
