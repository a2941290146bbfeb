#pragma once

#include <string>
#include <vector>

#include "platform/runtime/Message.h"

namespace ax {

// An override that was not grafted, since the target answers its selector with a method of another type.
struct LeftToHost {
  const Method* override;
  const Method* hostMethod;
  bool isClassMethod;
};

// What one category put onto its target's tables. Complete before the first of its entries answers; then it
// never changes, and lives as long as the process.
struct CategoryGraft {
  const Class* category = nullptr;
  const Class* target = nullptr;
  Method entry = {};  // stands for the category as a whole where no method of its was called
  std::vector<const Method*> methods = {};  // the entries as they stand in the target
  std::vector<LeftToHost> leftToHost = {};
};

// Puts every method of the category's own tables, class methods included, into the target's: from then on
// the target's instances answer them, and a call to super inside one reaches what stood there before, or
// what the target's superclass answers at that moment. Other threads may send messages meanwhile. What
// a category inherits stays behind, and so does a method whose selector the target, or a class above it,
// answers with a method of another type: the host's senders know that type alone. A category is grafted once:
// false when it has been before.
bool graftCategory(Class& category, Class& target);

// The graft of a category; null when it was never grafted.
const CategoryGraft* graftOf(const Class& category);

// What answered a grafted entry's message before it.
const Method& replacedBy(const Method& grafted);

// The entry that a call to super reaches from inside a grafted one. A message that was never used names no
// entry, and need not be resolved to see it.
const Method& superMethod(const Method& current, Selector selector);
const Method& superMethodOfAnother(const Method& current, const MessageRecord& message);
inline const Method& superMethod(const Method& current, const MessageRecord& message) {
  if (current.selector == message.selectorIfUsed()) [[likely]]
    return replacedBy(current);
  return superMethodOfAnother(current, message);
}

}  // namespace ax
