#include "host/daydetail/VLUIUnitManager.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& VLUIUnitManager::staticClass() {
  using T = VLUIUnitManager;
  static Class& result = ClassBuilder<T>("VLUIUnitManager", Object::staticClass())
                             .classMethod<&T::sharedManager>("sharedManager")
                             .method<&T::userActiveEnergyBurnedUnit>("userActiveEnergyBurnedUnit")
                             .build();
  return result;
}

Ref<VLUIUnitManager> VLUIUnitManager::sharedManager() {
  static NeverDestroyed<Ref<VLUIUnitManager>> shared(make<VLUIUnitManager>());
  return *shared;
}

Ref<Unit> VLUIUnitManager::userActiveEnergyBurnedUnit() {
  const Ref<Unit> kilocalories = Unit::kilocalorieUnit();
  const Ref<Unit> chosen = Unit::unitFromString(environment().energyUnit);
  return chosen && chosen->isCompatibleWithUnit(*kilocalories) ? chosen : kilocalories;
}

static const RegisteredClass<VLUIUnitManager> registered;

}  // namespace ax::host
