#pragma once

#include <string>
#include <vector>

#include "platform/runtime/Class.h"

namespace ax {

// What one category put onto its target's tables. Alive as long as the process.
struct CategoryGraft {
  const Class* category = nullptr;
  const Class* target = nullptr;
  Method entry = {};  // stands for the category as a whole where no method of its was called
  std::vector<const Method*> methods = {};  // the entries as they stand in the target
};

// Puts every method of the category's own tables, class methods included, into the target's: from then on
// the target's instances answer them, and a call to super inside one reaches what stood there before, or
// what the target's superclass answers at that moment. The methods by which a category describes itself stay
// behind. A category is grafted once: false when it has been before.
bool graftCategory(Class& category, Class& target);

// The graft of a category; null when it was never grafted.
const CategoryGraft* graftOf(const Class& category);

// The entry that a call to super reaches from inside a grafted one.
const Method& superMethod(const Method& current, Selector selector);

}  // namespace ax
