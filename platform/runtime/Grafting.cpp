#include "platform/runtime/Grafting.h"

#include <algorithm>
#include <array>
#include <deque>

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

const Method& replacedBy(const Method& grafted) {
  return grafted.former != nullptr ? *grafted.former : grafted.owner->lookUpInSuperclass(grafted.selector);
}

}  // namespace

void graftCategory(Class& category, Class& target) {
  static auto* const grafts = new std::deque<CategoryGraft>;
  CategoryGraft& graft = grafts->emplace_back();
  graft.category = &category;
  graftTable(category, target, graft);
  graftTable(category.metaclass(), target.metaclass(), graft);
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
