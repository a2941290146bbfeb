#include "platform/runtime/Grafting.h"

#include <deque>

namespace ax {

namespace {

// Keeps the entries that one table of the target is to answer.
std::vector<const Method*> keepEntries(const Class& from, Class& onto, CategoryGraft& graft) {
  std::vector<const Method*> kept;
  from.forEachOwnMethod([&](const Method& method) {
    const Method& answering = onto.lookUp(method.selector);
    if (answering.function != nullptr && answering.signature != method.signature) {
      graft.leftToHost.push_back({&method, &answering, onto.isMetaclass()});
      return;
    }
    Method entry = method;
    entry.former = onto.ownMethod(method.selector);
    entry.graft = &graft;
    kept.push_back(&onto.keepMethod(entry));
  });
  graft.methods.insert(graft.methods.end(), kept.begin(), kept.end());
  return kept;
}

std::deque<CategoryGraft>& grafts() {
  static auto* const all = new std::deque<CategoryGraft>;
  return *all;
}

}  // namespace

const Method& replacedBy(const Method& grafted) {
  return grafted.former != nullptr ? *grafted.former : grafted.owner->lookUpInSuperclass(grafted.selector);
}

bool graftCategory(Class& category, Class& target) {
  if (category.graft() != nullptr) return false;
  CategoryGraft& graft = grafts().emplace_back();
  graft.category = &category;
  graft.target = &target;
  graft.entry.owner = &target;
  graft.entry.selector = Selector::intern("");  // no message's, used or not
  graft.entry.graft = &graft;
  const std::vector<const Method*> methods = keepEntries(category, target, graft);
  const std::vector<const Method*> classMethods =
      keepEntries(category.metaclass(), target.metaclass(), graft);
  target.publishMethods(methods);
  target.metaclass().publishMethods(classMethods);
  category.setGraft(graft);
  return true;
}

const CategoryGraft* graftOf(const Class& category) {
  return category.graft();
}

const Method& superMethod(const Method& current, Selector selector) {
  if (current.selector == selector) return replacedBy(current);
  if (current.graft != nullptr) {
    for (const Method* method : current.graft->methods) {
      if (method->selector == selector && method->owner == current.owner) return replacedBy(*method);
    }
  }
  return current.owner->lookUp(selector);
}

const Method& superMethodOfAnother(const Method& current, const MessageRecord& message) {
  return superMethod(current, message.selector());
}

}  // namespace ax
