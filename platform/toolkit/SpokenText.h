#pragma once

#include "platform/foundation/Array.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/TreeDepth.h"

// Composing what is spoken. Parts are joined with the language's list separator; nil and empty ones drop out
// with theirs. When a part is an AccessibilityAttributedString, so is the result, and every part keeps its
// attributes over its own place in it. Of no parts the result is the empty text.
namespace ax {

// Ends every list of stringForVariables: "__AXStringForVariablesSentinel".
extern const Ref<String>& stringForVariablesSentinel;

// The parts up to the sentinel, which must be the last.
Ref<String> stringForVariables(std::initializer_list<Ref<String>> parts);

// The label of a part of an object, for a label of the object's own.
inline Ref<String> labelOfPart(Receiver whole, Receiver part) {
  return answerOfPart(messages::accessibilityLabel, whole, part);
}

// The labels of the elements. A String among them speaks its accessibility label, or else itself.
Ref<String> labelForElements(const Ref<Array>& elements);
Ref<String> labelForElements(std::initializer_list<Ref<Object>> elements);

// The labels of all visible accessible descendants, in the host's view order. An element's own descendants
// are not visited.
Ref<String> stringForAllChildren(Receiver view);

// The labels of the receiver's members under the keys: "_scoreView, _daysRemainingLabel".
Ref<String> _accessibilityStringForLabelKeyValues(Receiver receiver, std::string_view keyList);

// The text of the subtree below the receiver, in the host's view order. A descendant with the header trait is
// a header, an element without it is focusable; other views that have a label always count. Neither a view
// that speaks nor one that was left out is entered further.
Ref<String> _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(
    Receiver receiver, bool headers, bool focusableItems, const Ref<Array>& exclusions);

}  // namespace ax
