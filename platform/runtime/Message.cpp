#include "platform/runtime/Message.h"

namespace ax {

// Threads that come here together find the same and store it twice.
Selector MessageRecord::resolve() const {
  const Selector selector = Selector::intern(name_);
  signature_.store(&makeSignature_(), std::memory_order_relaxed);
  result_.store(findResult_(), std::memory_order_relaxed);
  place_.store(Class::placeOf(selector), std::memory_order_relaxed);
  record_.store(selector.record(), std::memory_order_release);
  return selector;
}

const Method& MessageRecord::answerSlowly(const Object& object) const {
  return object.isa().lookUp(selector());
}

bool MessageRecord::hasTypeOnceResolved(const Method& method) const {
  return method.signature == &signature();
}

}  // namespace ax
