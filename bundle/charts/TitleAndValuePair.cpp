#include "bundle/charts/TitleAndValuePair.h"

#include "bundle/core/Category.h"

namespace ax {

Ref<Object> preparedAsHeader(Ref<Object> pair) {
  if (!pair) return nullptr;
  messages::setIsAccessibilityElement(pair, true);
  messages::setAccessibilityLabel(
      pair,
      _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(pair, false, true, nullptr));
  _accessibilityAddTrait(pair, TraitHeader);
  return pair;
}

}  // namespace ax
