#pragma once

#include "host/core/Layout.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// The cell's parts in its content, one below the other in equal shares of the cell.
void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts);

// The part, made when there is none yet.
template <class T>
T& ensure(Ref<T>& part) {
  if (!part) part = make<T>();
  return *part;
}

}  // namespace ax::host
