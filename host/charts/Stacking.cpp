#include "host/charts/Stacking.h"

namespace ax::host {

void stackIn(View& parent, std::initializer_list<Ref<View>> parts) {
  const double height = parent.frame().height / static_cast<double>(parts.size());
  double top = 0;
  for (const Ref<View>& part : parts) {
    if (part && part->frame() == Rect()) part->setFrame({0, top, parent.frame().width, height});
    if (part && part->superview() == nullptr) parent.addSubview(part);
    top += height;
  }
}

}  // namespace ax::host
