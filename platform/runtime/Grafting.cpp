#include "platform/runtime/Grafting.h"

#include <algorithm>
#include <array>
#include <map>

namespace ax {

namespace {

bool describesCategory(Selector selector) {
  static const std::array anatomy = {Selector::intern("safeCategoryTargetClassName"),
                                     Selector::intern("safeCategoryBaseClass"),
                                     Selector::intern("_accessibilityPerformValidations:")};
  return std::find(anatomy.begin(), anatomy.end(), selector) != anatomy.end();
}

void graftTable(const Class& from, Class& onto, CategoryGraft& graft) {
  from.forEachOwnMethod([&](const Method& method) {
    if (describesCategory(method.selector)) return;
    Method grafted = method;
    grafted.former = onto.ownMethod(method.selector);
    grafted.graft = &graft;
    graft.methods.push_back(&onto.addMethod(grafted));
  });
}

std::map<const Class*, CategoryGraft>& grafts() {
  static auto* const all = new std::map<const Class*, CategoryGraft>;
  return *all;
}

const Method& replacedBy(const Method& grafted) {
  return grafted.former != nullptr ? *grafted.former : grafted.owner->lookUpInSuperclass(grafted.selector);
}

}  // namespace

bool graftCategory(Class& category, Class& target) {
  const auto [place, isNew] = grafts().try_emplace(&category);
  if (!isNew) return false;
  CategoryGraft& graft = place->second;
  graft.category = &category;
  graft.target = &target;
  graft.entry.owner = &target;
  graft.entry.graft = &graft;
  graftTable(category, target, graft);
  graftTable(category.metaclass(), target.metaclass(), graft);
  return true;
}

const CategoryGraft* graftOf(const Class& category) {
  const auto found = grafts().find(&category);
  return found == grafts().end() ? nullptr : &found->second;
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

}  // namespace ax
