#pragma once

#include "platform/runtime/Message.h"

namespace ax {

template <class Type>
class SafeMessage;

// A message to an object of the host whose answer may be missing: what the receiver raises counts as nil, NO
// or 0, as a guarded read does. Declared and sent like a Message.
template <class R, class... A>
class SafeMessage<R(A...)> {
 public:
  constexpr explicit SafeMessage(std::string_view name) : message_(name) {}

  R operator()(Receiver receiver, A... arguments) const {
    try {
      return message_(receiver, std::move(arguments)...);
    } catch (...) {
      return R();
    }
  }

 private:
  Message<R(A...)> message_;
};

}  // namespace ax
