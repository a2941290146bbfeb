#include "host/workouts/Placement.h"

namespace ax::host {

void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts) {
  stackIn(*cell.contentView(), {cell.frame().width, cell.frame().height}, parts);
}

}  // namespace ax::host
