#include "bench/Sides.h"
#include "platform/runtime/Class.h"

// Finding a class by a name that is written in the code, beside one that is known already.
namespace {

using namespace ax;

auto findByName() {
  return [] {
    for (int i = 0; i < bench::batch; i += 4) {
      benchmark::DoNotOptimize(safeClassFromString("Bench.Host"_key));
      benchmark::DoNotOptimize(safeClassFromString("Bench.Sent"_key));
      benchmark::DoNotOptimize(safeClassFromString("Bench.Overridden"_key));
      benchmark::DoNotOptimize(safeClassFromString("SafeCategory"_key));
    }
  };
}

auto findKnown() {
  return [known = std::make_shared<std::atomic<Class*>>(Class::named("Bench.Host"))] {
    for (int i = 0; i < bench::batch; ++i) benchmark::DoNotOptimize(known->load(std::memory_order_acquire));
  };
}

const bench::RegisteredSide sides[] = {{"class", "ours", findByName, bench::batch},
                                       {"class", "floor", findKnown, bench::batch}};

}  // namespace
