#include "bench/Sides.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/String.h"

// Values attached to an object: four of them, as a chart keeps, so that the one asked for is not the first.
namespace {

using namespace ax;

Ref<Object> storing() {
  Ref<Object> owner = make<Array>();
  owner->_accessibilitySetRetainedValueForKey(string("1"), "benchFirst"_key);
  owner->_accessibilitySetRetainedValueForKey(string("2"), "benchSecond"_key);
  owner->_accessibilitySetRetainedValueForKey(string("3"), "benchThird"_key);
  owner->_accessibilitySetRetainedValueForKey(string("4"), "benchFourth"_key);
  return owner;
}

auto getStored() {
  return [owner = storing()] {
    Object* receiver = owner.get();
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      benchmark::DoNotOptimize(receiver->_accessibilityValueForKey("benchThird"_key).get());
    }
  };
}

auto getStoredFirst() {
  return [owner = storing()] {
    Object* receiver = owner.get();
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      benchmark::DoNotOptimize(receiver->_accessibilityValueForKey("benchFirst"_key).get());
    }
  };
}

auto setStored() {
  return [owner = storing(), values = std::array<Ref<Object>, 2>{string("a"), string("b")}] {
    Object* receiver = owner.get();
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      receiver->_accessibilitySetRetainedValueForKey(values[i & 1], "benchThird"_key);
    }
  };
}

// The list alone, written for nothing else.
struct Entry {
  const void* key;
  Ref<Object> value;
  std::unique_ptr<Entry> next;
};

auto getListed(std::string_view wanted) {
  std::unique_ptr<Entry> first;
  for (const Key key : {"benchFourth"_key, "benchThird"_key, "benchSecond"_key, "benchFirst"_key})
    first = std::make_unique<Entry>(Entry{key.record(), string("1"), std::move(first)});
  return [first = std::shared_ptr<Entry>(std::move(first)), key = Selector::intern(wanted).record()] {
    const Entry* list = first.get();
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(list);
      const Entry* entry = list;
      while (entry != nullptr && entry->key != key) entry = entry->next.get();
      const Ref<Object> value = entry->value;
      benchmark::DoNotOptimize(value.get());
    }
  };
}

const bench::RegisteredSide sides[] = {
    {"get", "ours", getStored, bench::batch},
    {"get", "floor", [] { return getListed("benchThird"); }, bench::batch},
    {"get first", "ours", getStoredFirst, bench::batch},
    {"get first", "floor", [] { return getListed("benchFirst"); }, bench::batch},
    {"set", "ours", setStored, bench::batch}};

}  // namespace
