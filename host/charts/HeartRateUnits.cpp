#include "host/charts/HeartRateUnits.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/runtime/ClassBuilder.h"

// What the app adds to the platform's Quantity.
namespace ax::host {

namespace {

double ch_beatsPerMinute(Quantity& quantity) {
  return beatsPerMinute(quantity);
}

struct HostExtensions {
  HostExtensions() {
    ClassBuilder<Quantity>(Quantity::staticClass()).method<&ch_beatsPerMinute>("ch_beatsPerMinute");
  }
};

const HostExtensions hostExtensions;

}  // namespace

double beatsPerMinute(const Quantity& quantity) {
  static NeverDestroyed<Ref<Unit>> unit(Unit::unitFromString("count/min"));
  return quantity.doubleValueForUnit(*unit);
}

}  // namespace ax::host
