#include "host/core/Layout.h"

namespace ax::host {

void addUnplaced(View& parent, std::initializer_list<Ref<View>> parts) {
  for (const Ref<View>& part : parts) {
    if (part && part->superview() == nullptr) parent.addSubview(part);
  }
}

}  // namespace ax::host
