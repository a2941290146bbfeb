#pragma once

#include <span>

#include "platform/runtime/Ref.h"
#include "platform/runtime/Selector.h"

namespace ax {

class Class;
class Object;
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
  const void* result = nullptr;          // the C++ type of what it returns; null: any object
  const Class* owner = nullptr;          // the class in whose table the entry stands
  const Method* former = nullptr;        // what a grafted entry replaced in the same table, if anything
  const CategoryGraft* graft = nullptr;  // the graft that brought it, if one did
  GenericFunction unscripted = nullptr;  // what `function` was before a scripted answer stood in its place
  // Whether boxed objects are of the classes that the C++ arguments name; null when that is not known. Others
  // arrive as nil.
  bool (*takes)(std::span<const Ref<Object>>) = nullptr;
};

}  // namespace ax
