#pragma once

#include "platform/health/Unit.h"

namespace ax::host {

// The units that the user has chosen.
class VLUIUnitManager : public Object {
 public:
  static Class& staticClass();
  static Ref<VLUIUnitManager> sharedManager();

  // Kilocalories when the choice names no unit of energy.
  Ref<Unit> userActiveEnergyBurnedUnit();
};

}  // namespace ax::host
