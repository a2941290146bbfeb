#pragma once

#include <functional>
#include <span>
#include <string>
#include <string_view>
#include <typeinfo>
#include <vector>

#include "platform/runtime/Boxing.h"
#include "platform/runtime/Method.h"
#include "platform/runtime/Object.h"

namespace ax {

// The type of a message as the runtime sees it: every object is a Ref<Object>.
template <class T>
struct Canonical {
  using type = T;
};
template <class T>
struct Canonical<Ref<T>> {
  using type = Ref<Object>;
};
template <class T>
using CanonicalType = typename Canonical<std::remove_cvref_t<T>>::type;

// What is known of a method's type. One record per canonical C++ type, alive as long as the process.
struct Signature {
  // Type codes: the result first, then the arguments.
  std::span<const std::string_view> encodings;
  // Calls a method of this type with boxed arguments. Arguments that are missing or of the wrong kind arrive
  // as nil, NO or 0. A void result is nil.
  Ref<Object> (*invoke)(Object&, const Method&, std::span<const Ref<Object>>);
  // A function of this type that answers from the receiver's scripted answers (see ScriptedAnswers.h).
  GenericFunction scripted;
};

// One address per C++ type, in all modules of the process.
const void* internType(const std::type_info& type);

template <class T>
const void* identityOf() {
  static const void* const identity = internType(typeid(T));
  return identity;
}

const Signature& internSignature(const std::type_info& type, const Signature& signature);

// The reply that an object has been given for a message, if any. The first tells whether there is one.
std::pair<bool, Ref<Object>> scriptedAnswer(Object& receiver, const Method& method,
                                            std::span<const Ref<Object>> arguments);
GenericFunction unscriptedFunction(const Method& method);

template <class R, class... A>
struct SignatureMaker {
  using Function = R (*)(Object&, const Method&, A...);

  static Ref<Object> invoke(Object& self, const Method& method, std::span<const Ref<Object>> arguments) {
    return invokeIndexed(self, method, arguments, std::index_sequence_for<A...>());
  }

  template <std::size_t... I>
  static Ref<Object> invokeIndexed(Object& self, const Method& method,
                                   [[maybe_unused]] std::span<const Ref<Object>> arguments,
                                   std::index_sequence<I...>) {
    const auto function = reinterpret_cast<Function>(method.function);
    const auto argument = [&](std::size_t i) { return i < arguments.size() ? arguments[i] : Ref<Object>(); };
    (void)argument;
    if constexpr (std::is_void_v<R>) {
      function(self, method, unbox<A>(argument(I))...);
      return nullptr;
    } else {
      return box(function(self, method, unbox<A>(argument(I))...));
    }
  }

  static R scripted(Object& self, const Method& method, A... arguments) {
    const std::vector<Ref<Object>> boxed = {box(arguments)...};
    auto [found, answer] = scriptedAnswer(self, method, boxed);
    if (!found) {
      return reinterpret_cast<Function>(unscriptedFunction(method))(self, method, std::move(arguments)...);
    }
    if constexpr (!std::is_void_v<R>) return unbox<R>(answer);
  }

  static constexpr std::string_view encodings[] = {encodingOf<R>(), encodingOf<A>()...};

  static const Signature& signature() {
    static const Signature& result =
        internSignature(typeid(R(A...)), {encodings, &invoke, reinterpret_cast<GenericFunction>(&scripted)});
    return result;
  }
};

template <class R, class... A>
const Signature& signatureOf() {
  return SignatureMaker<CanonicalType<R>, CanonicalType<A>...>::signature();
}

}  // namespace ax
