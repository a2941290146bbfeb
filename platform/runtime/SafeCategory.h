#pragma once

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Grafting.h"
#include "platform/runtime/Message.h"

namespace ax {

// What a category's methods see: the host object that received the message, and the entry through which it
// came. It is made per call and keeps nothing; `self` outlives it.
class CategoryView {
 public:
  CategoryView(Object& receiver, const Method& method) : self(receiver), method_(method) {}

 protected:
  // What the target class answered before this category was grafted onto it.
  template <class R, class... A>
  R super(const Message<R(A...)>& message, std::type_identity_t<A>... arguments) const {
    return message.call(self, superMethod(method_, message.selector()), std::move(arguments)...);
  }

  Object& self;

 private:
  const Method& method_;
};

// The base of every category: C is the category itself, a view without members of its own.
template <class C>
class SafeCategory : public CategoryView {
 public:
  using CategoryView::CategoryView;
};

namespace registration {

template <class Type>
struct CanonicalFunction;
template <class R, class... A>
struct CanonicalFunction<R(A...)> {
  using type = CanonicalType<R>(CanonicalType<A>...);
};

template <auto Function, class Type = decltype(Function)>
struct CategoryMethod;
template <auto Function, class C, class R, class... A>
struct CategoryMethod<Function, R (C::*)(A...)> {
  using Type = R(A...);
  static CanonicalType<R> call(Object& self, const Method& method, CanonicalType<A>... arguments) {
    return (C(self, method).*Function)(specific<A>(arguments)...);
  }
  static Method make(Selector selector) { return record<R, A...>(selector, &call); }
};
template <auto Function, class C, class R, class... A>
struct CategoryMethod<Function, R (C::*)(A...) const> {
  using Type = R(A...);
  static CanonicalType<R> call(Object& self, const Method& method, CanonicalType<A>... arguments) {
    return (C(self, method).*Function)(specific<A>(arguments)...);
  }
  static Method make(Selector selector) { return record<R, A...>(selector, &call); }
};

}  // namespace registration

// One override: the entry that answers a message, for instances or, if so marked, for the class itself.
struct Override {
  Method method;
  bool isClassMethod = false;
};

// A category's method for a message of the same type; another type does not compile.
template <auto Function, class Type>
Override overrides(const Message<Type>& message) {
  using Given = typename registration::CategoryMethod<Function>::Type;
  static_assert(std::is_same_v<typename registration::CanonicalFunction<Given>::type,
                               typename registration::CanonicalFunction<Type>::type>,
                "the method's type is not the message's");
  return {registration::CategoryMethod<Function>::make(message.selector())};
}

// The same for a class method; the receiver is the class object.
template <auto Function, class Type>
Override overridesClassMethod(const Message<Type>& message) {
  Override result = overrides<Function>(message);
  result.isClassMethod = true;
  return result;
}

}  // namespace ax
