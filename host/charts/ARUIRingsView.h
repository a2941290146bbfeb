#pragma once

#include "platform/toolkit/View.h"

namespace ax::host {

// The rings library's picture of a day. It is one element and reads whatever label its owner gave it.
class ARUIRingsView : public View {
 public:
  static Class& staticClass();

 protected:
  bool defaultIsElement() override { return true; }
};

}  // namespace ax::host
