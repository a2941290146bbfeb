#pragma once

#include "platform/foundation/String.h"

namespace ax::host {

// The app's own words, in the environment's language. Main thread only.
class HostStrings : public Object {
 public:
  static Class& staticClass();

  // Nil for a key that the app's string table lacks.
  static Ref<String> textForKey(const Ref<String>& key);
};

}  // namespace ax::host
