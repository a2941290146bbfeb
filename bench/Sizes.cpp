#include "bench/Sizes.h"

#include <malloc.h>

#include <vector>

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/View.h"

namespace bench {

namespace {

using namespace ax;

class Bare : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Bare>("Bench.Bare", Object::staticClass()).build();
    return result;
  }
};

constexpr int count = 10'000;

// What the heap grows by for each call, chunk headers included.
template <class Make>
double bytesEach(Make make) {
  make(0);
  const std::size_t before = mallinfo2().uordblks;
  for (int i = 1; i <= count; ++i) make(i);
  return static_cast<double>(mallinfo2().uordblks - before) / count;
}

}  // namespace

Sizes measureSizes() {
  std::vector<Ref<Object>> objects(count + 1);
  std::vector<Ref<Object>> views(count + 1);
  const Ref<Object> value = string("value");
  Sizes sizes;
  sizes.object = bytesEach([&](int i) { objects[i] = make<Bare>(); });
  sizes.storedValue =
      bytesEach([&](int i) { objects[i]->_accessibilitySetRetainedValueForKey(value, "benchSize"_key); });
  sizes.view = bytesEach([&](int i) { views[i] = make<View>(); });
  return sizes;
}

}  // namespace bench
