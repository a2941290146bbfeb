#pragma once

#include <map>
#include <vector>

#include "platform/runtime/Class.h"

// Objects of every class that the bundle extends, with all their parts, for what must hold of each of them.
namespace ax {

using ObjectSet = std::map<Object*, Ref<Object>>;

// The classes onto which the module has put its categories, those that can be made; it must have started.
std::vector<Class*> extendedClasses();

// Gives an object a part wherever it has room for one that can be shown: in its variables and, through its
// setters, in its properties.
void furnish(Object& object);

// What the app does to show it: controllers load, views are laid out.
void show(Object& object);

// Asks everything that a reader may ask. What comes back is put into `seen`.
void askEverything(Object& object, ObjectSet& seen);

// All that can be reached from an object through views, layers, elements and variables, itself included.
ObjectSet everythingIn(Object& object);

// The methods that the app declares for a class itself, below what the bundle has put onto it.
std::vector<const Method*> hostMethods(const Class& start);

}  // namespace ax
