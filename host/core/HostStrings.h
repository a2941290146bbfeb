#pragma once

#include <initializer_list>

#include "platform/foundation/String.h"

namespace ax::host {

// The app's own words, in the environment's language, as scenes ask for them. Main thread only.
class HostStrings : public Object {
 public:
  static Class& staticClass();

  // Nil for a key that the app's string table lacks.
  static Ref<String> textForKey(const Ref<String>& key);
};

// The text of a key, its pattern filled; empty for a key that the table lacks.
Ref<String> hostText(std::string_view key, std::initializer_list<Ref<Object>> arguments = {});

}  // namespace ax::host
