#pragma once

#include "bundle/core/Export.h"
#include "platform/foundation/Array.h"

namespace ax {

// The principal class: the platform's runtime talks to the bundle through its two class methods. It has no
// instances; its class object is also where the bundle's resources are found.
class AXVeltoGlue final : public Object {
 public:
  static Class& staticClass();

  // Further bundles to load: none.
  static Ref<Array> accessibilityBundles() { return nullptr; }
  // Checks the host contract and installs every category, once per process. Whoever calls while that goes on
  // waits for its end. Any thread.
  static void accessibilityInitializeBundle();
};

}  // namespace ax
