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

auto setStored() {
  return [owner = storing(), values = std::array<Ref<Object>, 2>{string("a"), string("b")}] {
    Object* receiver = owner.get();
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      receiver->_accessibilitySetRetainedValueForKey(values[i & 1], "benchThird"_key);
    }
  };
}

const bench::RegisteredSide sides[] = {{"get", "ours", getStored, bench::batch},
                                       {"set", "ours", setStored, bench::batch}};

}  // namespace
