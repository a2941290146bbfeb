#include <array>

#include "bench/Sides.h"
#include "platform/accessibility/CategoryRegistration.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Grafting.h"
#include "platform/runtime/SafeCategory.h"

// A typed send and an override that calls super, beside a C++ virtual call.
namespace {

using namespace ax;

const Message<std::int64_t(std::int64_t)> advance{"benchAdvance:"};

class Plain {
 public:
  virtual ~Plain() = default;
  virtual std::int64_t advance(std::int64_t by) { return total += by; }
  std::int64_t total = 0;
};

class Sent : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Sent>("Bench.Sent", Object::staticClass())
                               .method<&Sent::advance>("benchAdvance:")
                               .build();
    return result;
  }
  std::int64_t advance(std::int64_t by) { return total += by; }
  std::int64_t total = 0;
};

class Overridden : public Sent {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Overridden>("Bench.Overridden", Sent::staticClass())
                               .method<&Overridden::advance>("benchAdvance:")
                               .build();
    return result;
  }
};

class Overriding : public SafeCategory {
 public:
  std::int64_t advance(std::int64_t by) { return super(::advance, by); }
};
constexpr std::array rows = {overrides<&Overriding::advance>(advance)};
constexpr CategoryRecord record{"BenchOverriding", "Bench.Overridden", "Bench", nullptr, rows};

auto sendNothing() {
  return [object = std::make_shared<Plain>()] {
    Plain* receiver = object.get();
    for (std::int64_t i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      std::int64_t answer = i;
      benchmark::DoNotOptimize(answer);
    }
  };
}

auto sendVirtually() {
  return [object = std::make_shared<Plain>()] {
    Plain* receiver = object.get();
    for (std::int64_t i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      benchmark::DoNotOptimize(receiver->advance(i));
    }
  };
}

template <class T>
auto send() {
  return [object = make<T>()] {
    Object* receiver = object.get();
    for (std::int64_t i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(receiver);
      benchmark::DoNotOptimize(advance(receiver, i));
    }
  };
}

auto sendToOverride() {
  static Class& category = registerCategory(record);
  graftCategory(category, Overridden::staticClass());
  return send<Overridden>();
}

const bench::RegisteredSide sides[] = {{"send", "ours", send<Sent>, bench::batch},
                                       {"send", "floor", sendVirtually, bench::batch},
                                       {"super", "ours", sendToOverride, bench::batch},
                                       {"super", "floor", sendVirtually, bench::batch},
                                       {"loop", "ours", sendNothing, bench::batch}};

}  // namespace
