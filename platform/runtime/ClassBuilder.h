#pragma once

#include <bit>

#include "platform/runtime/Class.h"
#include "platform/runtime/Signature.h"
#include "platform/runtime/Weak.h"

namespace ax {

// From here on templates that turn C++ members into plain records of function pointers.
namespace registration {

template <class T>
struct MemberType;
template <class Owner, class T>
struct MemberType<T Owner::*> {
  using type = T;
};

template <class T>
struct Declared {
  static std::string type() { return std::string(encodingOf<T>()); }
};
template <class T>
struct Declared<Ref<T>> {
  static std::string type() { return T::staticClass().name(); }
};
template <class T>
struct Declared<Weak<T>> : Declared<Ref<T>> {};

template <class T>
struct FieldAccess {
  static Ref<Object> read(const T& field) { return box(field); }
  static bool write(T& field, const Ref<Object>& value) {
    if (value && !Boxed<T>::holds(*value)) return false;
    field = unbox<T>(value);
    return true;
  }
};
template <class T>
struct FieldAccess<Ref<T>> {
  static Ref<Object> read(const Ref<T>& field) { return field; }
  static bool write(Ref<T>& field, const Ref<Object>& value) {
    const bool isOfKind = !value || cast<T>(value);
    if (isOfKind) field = cast<T>(value);
    return isOfKind;
  }
};
template <class T>
struct FieldAccess<Weak<T>> {
  static Ref<Object> read(const Weak<T>& field) { return field.lock(); }
  static bool write(Weak<T>& field, const Ref<Object>& value) {
    const bool isOfKind = !value || cast<T>(value);
    if (isOfKind) field = cast<T>(value);
    return isOfKind;
  }
};

template <class Owner, auto Member>
struct Variable {
  using Access = FieldAccess<typename MemberType<decltype(Member)>::type>;
  static Ref<Object> read(const Object& self) {
    return Access::read(static_cast<const Owner&>(self).*Member);
  }
  static bool write(Object& self, const Ref<Object>& value) {
    return Access::write(static_cast<Owner&>(self).*Member, value);
  }
};

// How far from the beginning of an object a member lies that is nothing but the address of another; -1 for
// members of any other form.
template <auto Member, class Owner, class T>
std::ptrdiff_t offsetIn(T Owner::*) {
  return -1;
}
template <auto Member, class Owner, class T>
requires std::is_base_of_v<Object, Owner> && std::is_base_of_v<Object, T> std::ptrdiff_t offsetIn(
    Ref<T> Owner::*) {
  static_assert(sizeof(Ref<T>) == sizeof(std::uintptr_t), "the handle is nothing but an address");
  static_assert(sizeof(Ref<T> Owner::*) == sizeof(std::ptrdiff_t),
                "in the Itanium C++ ABI a pointer to a data member is the member's offset");
  const auto atSameAddress = []<class U>(U* object) {
    return static_cast<void*>(static_cast<Object*>(object)) == static_cast<void*>(object);
  };
  const auto somewhere = std::uintptr_t(1) << 16;
  // NOLINTBEGIN(performance-no-int-to-ptr): the pointers are compared, never followed
  auto* const owner = reinterpret_cast<Owner*>(somewhere);
  auto* const member = reinterpret_cast<T*>(somewhere);
  // NOLINTEND(performance-no-int-to-ptr)
  const bool begins = atSameAddress(owner) && atSameAddress(member);
  return begins ? std::bit_cast<std::ptrdiff_t>(Member) : -1;
}
template <auto Member>
std::ptrdiff_t objectOffset() {
  return offsetIn<Member>(Member);
}

// The canonical form of a result or an argument, and back.
template <class T>
CanonicalType<T> canonical(T&& value) {
  return std::forward<T>(value);
}
template <class T>
std::remove_cvref_t<T> specific(CanonicalType<T>& value) {
  if constexpr (std::is_same_v<std::remove_cvref_t<T>, CanonicalType<T>>) {
    return std::move(value);
  } else {
    return cast<typename std::remove_cvref_t<T>::Target>(std::move(value));
  }
}

// Whether a boxed argument is of the class that the C++ type names. Scalars are told apart by their codes.
template <class T>
bool isOfClass(const Ref<Object>& value, const Ref<T>*) {
  return !value || cast<T>(value.get()) != nullptr;
}
inline bool isOfClass(const Ref<Object>&, const void*) {
  return true;
}

template <class... A>
bool takesArguments([[maybe_unused]] std::span<const Ref<Object>> values) {
  [[maybe_unused]] std::size_t i = 0;
  return (... && (i >= values.size() ||
                  isOfClass(values[i++], static_cast<const std::remove_cvref_t<A>*>(nullptr))));
}

template <class R, class... A>
Method record(Selector selector, CanonicalType<R> (*function)(Object&, const Method&, CanonicalType<A>...)) {
  return {.selector = selector,
          .signature = &signatureOf<R, A...>(),
          .function = reinterpret_cast<GenericFunction>(function),
          .result = identityOf<std::remove_cvref_t<R>>(),
          .takes = &takesArguments<A...>};
}

template <class Owner, auto Function, class Type = decltype(Function)>
struct InstanceMethod;
template <class Owner, auto Function, class C, class R, class... A>
struct InstanceMethod<Owner, Function, R (C::*)(A...)> {
  static CanonicalType<R> call(Object& self, const Method&, CanonicalType<A>... arguments) {
    return (static_cast<Owner&>(self).*Function)(specific<A>(arguments)...);
  }
  static Method make(Selector selector) { return record<R, A...>(selector, &call); }
};
template <class Owner, auto Function, class C, class R, class... A>
struct InstanceMethod<Owner, Function, R (C::*)(A...) const>
    : InstanceMethod<Owner, Function, R (C::*)(A...)> {};
template <class Owner, auto Function, class C, class R, class... A>
struct InstanceMethod<Owner, Function, R (*)(C&, A...)> {
  static CanonicalType<R> call(Object& self, const Method&, CanonicalType<A>... arguments) {
    return Function(static_cast<C&>(self), specific<A>(arguments)...);
  }
  static Method make(Selector selector) { return record<R, A...>(selector, &call); }
};

template <auto Function, class Type = decltype(Function)>
struct ClassMethod;
template <auto Function, class R, class... A>
struct ClassMethod<Function, R (*)(A...)> {
  static CanonicalType<R> call(Object&, const Method&, CanonicalType<A>... arguments) {
    return Function(specific<A>(arguments)...);
  }
  static Method make(Selector selector) { return record<R, A...>(selector, &call); }
};

template <class T>
Ref<Object> (*factoryOf())() {
  if constexpr (std::is_default_constructible_v<T>) {
    return [] { return Ref<Object>(make<T>()); };
  } else {
    return nullptr;
  }
}

}  // namespace registration

// Registers a C++ class, or more members of a registered one, under runtime names:
//
//   Class& Clock::staticClass() {
//     static Class& result = ClassBuilder<Clock>("Clock", View::staticClass())
//                                .instanceVariable<&Clock::label_>("_label")
//                                .method<&Clock::tick>("tick")
//                                .build();
//     return result;
//   }
//   static const RegisteredClass<Clock> registered;
//
// A method may also be a free function that takes the receiver as `T&` first. Declared types and signatures
// come from the C++ types: Ref<Label> is of type "Label", an object, "@", in a signature.
template <class T>
class ClassBuilder {
 public:
  explicit ClassBuilder(std::string name) : class_(Class::add(std::move(name), nullptr, nullptr)) {}
  ClassBuilder(std::string name, Class& superclass)
      : class_(Class::add(std::move(name), &superclass, registration::factoryOf<T>())) {}
  // More members for a class that stands already.
  explicit ClassBuilder(Class& existing) : class_(existing) {}

  template <auto Member>
  ClassBuilder& instanceVariable(std::string_view name) {
    using Type = typename registration::MemberType<decltype(Member)>::type;
    class_.addInstanceVariable({.selector = Selector::intern(name),
                                .objectOffset = registration::objectOffset<Member>(),
                                .type = &registration::Declared<Type>::type,
                                .read = &registration::Variable<T, Member>::read,
                                .write = &registration::Variable<T, Member>::write});
    return *this;
  }

  template <auto Function>
  ClassBuilder& method(std::string_view name) {
    class_.addMethod(registration::InstanceMethod<T, Function>::make(Selector::intern(name)));
    return *this;
  }

  // A getter under `name` and a setter under `set<Name>:`.
  template <auto Getter, auto Setter>
  ClassBuilder& property(std::string_view name) {
    return method<Getter>(name).template method<Setter>(setterName(name));
  }

  template <auto Function>
  ClassBuilder& classMethod(std::string_view name) {
    class_.metaclass().addMethod(registration::ClassMethod<Function>::make(Selector::intern(name)));
    return *this;
  }

  ClassBuilder& conformsTo(std::string protocol) {
    class_.addProtocol(std::move(protocol));
    return *this;
  }

  Class& build() { return class_; }

  static std::string setterName(std::string_view property) {
    std::string name = "set" + std::string(property) + ":";
    if (name[3] >= 'a' && name[3] <= 'z') name[3] = static_cast<char>(name[3] - 'a' + 'A');
    return name;
  }

 private:
  Class& class_;
};

// Stands at the end of a class's source file and registers it when its library is loaded.
template <class T>
struct RegisteredClass {
  RegisteredClass() { T::staticClass(); }
};

}  // namespace ax
