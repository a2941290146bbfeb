#pragma once

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Grafting.h"
#include "platform/runtime/Message.h"

namespace ax {

// The base of every category, which has no members of its own: what its methods see of the host object that
// received the message, and of the entry through which it came. It is made per call and keeps nothing; `self`
// outlives it.
class SafeCategory {
 public:
  SafeCategory(Object& receiver, const Method& method) : self(receiver), method_(method) {}

  // Whether what was replaced has raised something in this call.
  bool superHasRaised() const { return superHasRaised_; }

 protected:
  // What the target class answered before this category was grafted onto it.
  template <class R, class... A>
  R super(const Message<R(A...)>& message, std::type_identity_t<A>... arguments) const {
    try {
      return message.call(self, superMethod(method_, message), std::move(arguments)...);
    } catch (...) {
      superHasRaised_ = true;
      throw;
    }
  }

  Object& self;

 private:
  const Method& method_;
  mutable bool superHasRaised_ = false;
};

// An object seen as a category, through one of the entries that the category brought.
template <class C>
C seenAs(Object& object, const Method& method) {
  if constexpr (std::is_aggregate_v<C>) {
    return C{{object, method}};
  } else {
    return C(object, method);
  }
}

namespace registration {

template <class Type>
struct CanonicalFunction;
template <class R, class... A>
struct CanonicalFunction<R(A...)> {
  using type = CanonicalType<R>(CanonicalType<A>...);
};

// Runs a category's method. What it raises counts as nil, NO or 0, except what came out of the method that it
// replaced: the host's senders get that as they would without the category.
template <auto Function, class C, class R, class... A>
CanonicalType<R> answerOfCategory(Object& self, const Method& method, CanonicalType<A>&... arguments) {
  C view = seenAs<C>(self, method);
  try {
    return (view.*Function)(specific<A>(arguments)...);
  } catch (...) {
    if (view.superHasRaised()) throw;
    return CanonicalType<R>();
  }
}

template <auto Function, class Type = decltype(Function)>
struct CategoryMethod;
template <auto Function, class C, class R, class... A>
struct CategoryMethod<Function, R (C::*)(A...)> {
  using Type = typename CanonicalFunction<R(A...)>::type;
  static CanonicalType<R> call(Object& self, const Method& method, CanonicalType<A>... arguments) {
    return answerOfCategory<Function, C, R, A...>(self, method, arguments...);
  }
  static GenericFunction function() { return reinterpret_cast<GenericFunction>(&call); }
  static constexpr auto result = &identityOf<std::remove_cvref_t<R>>;
  static constexpr auto takes = &takesArguments<A...>;
};
template <auto Function, class C, class R, class... A>
struct CategoryMethod<Function, R (C::*)(A...) const> : CategoryMethod<Function, R (C::*)(A...)> {};

}  // namespace registration

// One override as constant data: the message that it answers, and with what.
struct Override {
  const MessageRecord* message = nullptr;
  GenericFunction (*function)() = nullptr;
  const void* (*result)() = nullptr;
  bool (*takes)(std::span<const Ref<Object>>) = nullptr;
  bool isClassMethod = false;
};

// A category's method for a message of the same type; another type does not compile. The message lives as
// long as the process.
template <auto Function, class Type>
constexpr Override overrides(const Message<Type>& message) {
  using Given = registration::CategoryMethod<Function>;
  static_assert(std::is_same_v<typename Given::Type, typename registration::CanonicalFunction<Type>::type>,
                "the method's type is not the message's");
  return {&message, &Given::function, Given::result, Given::takes};
}

// The same for a class method; the receiver is the class object.
template <auto Function, class Type>
constexpr Override overridesClassMethod(const Message<Type>& message) {
  Override result = overrides<Function>(message);
  result.isClassMethod = true;
  return result;
}

}  // namespace ax
