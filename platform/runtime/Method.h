#pragma once

#include "platform/runtime/Selector.h"

namespace ax {

class Class;
struct CategoryGraft;
struct Signature;

using GenericFunction = void (*)();

// One entry of a method table. `function` takes the receiver and this record before the message's own
// arguments, so that an override knows which entry it is and what it replaced. Records live as long as the
// process.
struct Method {
  Selector selector = {};
  const Signature* signature = nullptr;
  GenericFunction function = nullptr;    // null: the class lacks the message
  const Class* owner = nullptr;          // the class in whose table the entry stands
  const Method* former = nullptr;        // what a grafted entry replaced in the same table, if anything
  const CategoryGraft* graft = nullptr;  // the graft that brought it, if one did
  GenericFunction unscripted = nullptr;  // what `function` was before a scripted answer stood in its place
};

}  // namespace ax
