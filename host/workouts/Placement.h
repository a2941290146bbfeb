#pragma once

#include "platform/toolkit/Label.h"
#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// Puts a part of a view in its place, unless somebody gave it another frame or another superview before. Nil
// parts are left out.
void showIn(View& parent, const Ref<View>& part, Rect frame);

// The same for each of a cell's parts, one below the other.
void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts);

// The part, made when there is none yet.
template <class T>
T& ensure(Ref<T>& part) {
  if (!part) part = make<T>();
  return *part;
}

}  // namespace ax::host
