#include <rttr/registration>
#include <rttr/type>

#include <memory>

#include "bench/Sides.h"
#include "bench/peers/PropertyNames.h"

// Properties by name of a class that is registered with RTTR.
namespace {

struct Shown {};

struct Host {
  Shown shown;
  Shown* label = &shown;
  RTTR_ENABLE()

 public:
  virtual ~Host() = default;
};

RTTR_REGISTRATION {
  rttr::registration::class_<Host> host("AxveltoBenchHost");
  for (const char* name : bench::propertyNames) host.property(name, &Host::label);
}

auto readByName() {
  return [host = std::make_shared<Host>()] {
    for (int i = 0; i < bench::batch; ++i) {
      const rttr::variant read = host->get_type().get_property(bench::propertyNames[i & 7]).get_value(*host);
      benchmark::DoNotOptimize(read.get_value<Shown*>());
    }
  };
}

const bench::RegisteredSide side("read text", "RTTR", readByName, bench::batch);

}  // namespace
