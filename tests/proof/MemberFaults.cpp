#include "tests/proof/MemberFaults.h"

#include <array>
#include <cmath>
#include <limits>

#include "platform/foundation/Array.h"
#include "platform/runtime/Boxing.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/ScriptedAnswers.h"

namespace ax::proof {

namespace {

using Kind = MemberKind;

bool anyKind(Kind) {
  return true;
}
bool isObject(Kind kind) {
  return kind == Kind::object || kind == Kind::array || kind == Kind::number;
}
bool isArray(Kind kind) {
  return kind == Kind::array || kind == Kind::object;
}
bool isNumber(Kind kind) {
  return kind == Kind::number || kind == Kind::scalar || kind == Kind::geometry;
}
bool isWhole(Kind kind) {
  return kind == Kind::number || kind == Kind::scalar || kind == Kind::flag;
}

Ref<Object> filled(const HostMember& member, double value) {
  if (member.kind != Kind::geometry) return number(value);
  const std::string code = member.variable != nullptr ? member.variable->type()
                                                      : std::string(member.method->signature->encodings[0]);
  if (code == encodingOf<Point>()) return box(Point{value, value});
  if (code == encodingOf<Size>()) return box(Size{value, value});
  if (code == encodingOf<Insets>()) return box(Insets{value, value, value, value});
  return box(Rect{value, value, value, value});
}

auto is(double value) {
  return [value](Object&, const HostMember& member, const OwnAnswer&) { return filled(member, value); };
}
auto isInteger(std::int64_t value) {
  return [value](Object&, const HostMember&, const OwnAnswer&) { return box(value); };
}
Ref<Object> raise(Object&, const HostMember& member, const OwnAnswer&) {
  throw MemberRaised(member.selector);
}
Ref<Object> nil(Object&, const HostMember&, const OwnAnswer&) {
  return nullptr;
}
Ref<Object> otherClass(Object&, const HostMember&, const OwnAnswer&) {
  return make<Object>();
}
Ref<Object> receiverItself(Object& receiver, const HostMember&, const OwnAnswer&) {
  return Ref<Object>(&receiver);
}
Ref<Object> emptyArray(Object&, const HostMember&, const OwnAnswer&) {
  return array({});
}
Ref<Object> foreignItems(Object&, const HostMember&, const OwnAnswer&) {
  return array({make<Object>(), number(7), array({}), make<Object>()});
}
// What stands in the list, over and over.
Ref<Object> manyItems(Object&, const HostMember&, const OwnAnswer& own) {
  const Ref<Array> few = cast<Array>(own());
  Array::Items items;
  for (std::size_t i = 0; i < 100'000; ++i)
    items.push_back(few && !few->isEmpty() ? few->at(i % few->count()) : make<Object>());
  return array(std::move(items));
}

constexpr double endless = std::numeric_limits<double>::infinity();
constexpr double noNumber = std::numeric_limits<double>::quiet_NaN();

struct Place {
  HostMember member;
  const MemberFault* fault;
};
std::vector<Place> places;
std::set<std::size_t> touched;
std::size_t suspended = 0;

// Whether a fault answers instead, and what.
std::pair<bool, Ref<Object>> answerAt(std::size_t place, Object& receiver, const OwnAnswer& own) {
  if (suspended != 0) return {false, nullptr};
  touched.insert(place);
  const Place& at = places[place];
  if (at.fault == nullptr) return {false, nullptr};
  return {true, at.fault->answer(receiver, at.member, own)};
}

// An instance variable is read by a plain function, so that each place needs one of its own.
constexpr std::size_t mostPlaces = 3000;
using Reader = Ref<Object> (*)(const Object&);
std::array<Reader, mostPlaces> ownReaders;

template <std::size_t I>
Ref<Object> readAt(const Object& object) {
  const auto own = [&] { return ownReaders[I](object); };
  const auto [isFaulty, answer] = answerAt(I, const_cast<Object&>(object), own);
  return isFaulty ? answer : own();
}

template <std::size_t... I>
constexpr std::array<Reader, sizeof...(I)> readersAt(std::index_sequence<I...>) {
  return {&readAt<I>...};
}
constexpr std::array<Reader, mostPlaces> readers = readersAt(std::make_index_sequence<mostPlaces>());

void stepIn(std::size_t place, const HostMember& member) {
  if (member.variable != nullptr) {
    auto& variable = const_cast<InstanceVariable&>(*member.variable);
    ownReaders.at(place) = variable.read;
    variable.read = readers.at(place);
    variable.objectOffset = -1;
    return;
  }
  setMethodAnswer(*member.method, [place, method = member.method](Object& receiver, auto arguments) {
    const auto own = [&] {
      Method unscripted = *method;
      unscripted.function = method->unscripted;
      return method->signature->invoke(receiver, unscripted, arguments);
    };
    return answerAt(place, receiver, own);
  });
}

// Of a type that no member of the host has.
double changed(Object&, const Method&, Ref<Object>, double given, Ref<Object>) {
  return given + 1;
}

void changeType(const HostMember& member) {
  if (member.method != nullptr) {
    using registration::record;
    member.declaring->addMethod(record<double, Ref<Object>, double, Ref<Object>>(member.selector, &changed));
    return;
  }
  auto& variable = const_cast<InstanceVariable&>(*member.variable);
  variable.objectOffset = -1;
  variable.type = [] { return std::string("Calendar"); };
  variable.read = [](const Object&) -> Ref<Object> { return make<Object>(); };
}

}  // namespace

const std::vector<MemberFault>& memberFaults() {
  static const std::vector<MemberFault> faults = {
      {"missing", anyKind, nullptr},
      {"of another type", anyKind, nullptr},
      {"raising", anyKind, raise},
      {"nil", anyKind, nil},
      {"of another class", isObject, otherClass},
      {"its own receiver", isObject, receiverItself},
      {"empty", isArray, emptyArray},
      {"of foreign objects", isArray, foreignItems},
      {"of 100,000 items", isArray, manyItems},
      {"NaN", isNumber, is(noNumber)},
      {"infinite", isNumber, is(endless)},
      {"negative infinite", isNumber, is(-endless)},
      {"negative", isNumber, is(-7.5)},
      {"zero", isNumber, is(0)},
      {"huge", isNumber, is(1e300)},
      {"the smallest integer", isWhole, isInteger(std::numeric_limits<std::int64_t>::min())},
      {"the largest integer", isWhole, isInteger(std::numeric_limits<std::int64_t>::max())},
  };
  return faults;
}

void breakMember(const HostMember& member, const MemberFault& fault) {
  if (fault.answer != nullptr) {
    places.assign(1, {member, &fault});
    return stepIn(0, member);
  }
  if (fault.name != "missing") return changeType(member);
  Class& named = *Class::namedEvenIfHidden(member.declaring->name());
  named.hideMember(member.selector.name());
}

void watchMembers(const std::vector<HostMember>& members) {
  places.clear();
  for (const HostMember& member : members) {
    places.push_back({member, nullptr});
    stepIn(places.size() - 1, member);
  }
}

std::set<std::size_t> takeTouched() {
  return std::exchange(touched, {});
}

WithoutFaults::WithoutFaults() {
  ++suspended;
}
WithoutFaults::~WithoutFaults() {
  --suspended;
}

}  // namespace ax::proof
