#include "host/workouts/Placement.h"

namespace ax::host {

void showIn(View& parent, const Ref<View>& part, Rect frame) {
  if (!part) return;
  if (part->frame() == Rect()) part->setFrame(frame);
  if (part->superview() == nullptr) parent.addSubview(part);
}

void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts) {
  const double height = cell.frame().height / static_cast<double>(std::max<std::size_t>(parts.size(), 1));
  double y = 0;
  for (const Ref<View>& part : parts) {
    showIn(*cell.contentView(), part, {0, y, cell.frame().width, height});
    y += height;
  }
}

}  // namespace ax::host
