#pragma once

#include <initializer_list>

#include "platform/toolkit/TableViewCell.h"

namespace ax::host {

// Puts the parts that stand nowhere yet into a view, in this order; nil ones are passed over. A layout pass
// may call it again and again.
void addUnplaced(View& parent, std::initializer_list<Ref<View>> parts);

// The same for one part, which gets the frame unless it has one of its own.
void addUnplaced(View& parent, const Ref<View>& part, Rect frame);

// Puts a part of a view in its place as the language has it, unless it has a superview or a frame with an
// area of its own. Nil parts are left out.
void showIn(View& parent, const Ref<View>& part, Rect frame);

// The same for several, one below the other in equal shares of a size.
void stackIn(View& parent, Size size, std::initializer_list<Ref<View>> parts);
// In shares of the parent's own size.
void stackIn(View& parent, std::initializer_list<Ref<View>> parts);
// In a cell's content, in shares of the cell.
void stackIn(TableViewCell& cell, std::initializer_list<Ref<View>> parts);

// The part, made when there is none yet.
template <class T>
T& ensure(Ref<T>& part) {
  if (!part) part = make<T>();
  return *part;
}

// A frame in a view as the language has it: it is meant for one that is written from the left, and is turned
// around for one that is written from the right.
Rect inDirection(const View& view, Rect frame);

// One of several equal columns of a view, counted from 0 at the left, in the view's own space.
Rect columnOf(const View& view, std::size_t index, std::size_t count);

}  // namespace ax::host
