#include "platform/toolkit/SpokenText.h"

#include <algorithm>

#include "platform/formatting/Lists.h"
#include "platform/toolkit/ElementTree.h"

namespace ax {

namespace {

class Composition {
 public:
  void add(const Ref<String>& part) {
    if (isEmpty(part)) return;
    if (++count_ == 1) first_ = part;
    if (count_ > 1) text_ += formatting::listSeparator();
    if (const auto* spoken = cast<AccessibilityAttributedString>(part.get())) {
      isAttributed_ = true;
      for (TextAttribute attribute : spoken->attributes()) {
        attribute.range.location += text_.size();
        attributes_.push_back(std::move(attribute));
      }
    }
    text_ += part->text();
  }

  Ref<String> result() {
    if (count_ == 0) return emptyString();
    if (count_ == 1) return first_;
    if (!isAttributed_) return string(std::move(text_));
    Ref<AccessibilityAttributedString> spoken = make<AccessibilityAttributedString>(std::move(text_));
    for (const TextAttribute& attribute : attributes_) {
      spoken->setAttributeForKeyWithRange(attribute.value, attribute.key, attribute.range);
    }
    return spoken;
  }

 private:
  std::size_t count_ = 0;
  bool isAttributed_ = false;
  Ref<String> first_;
  std::string text_;
  std::vector<TextAttribute> attributes_;
};

// Labels are composed of labels. What is being asked for its own adds nothing to it, or parts that hold one
// another would never come to an end.
Ref<String> labelOf(const Ref<Object>& element) {
  const PartQuestion question(messages::accessibilityLabel.selector(), element);
  return question.mayBePut() ? messages::accessibilityLabel(element) : nullptr;
}

Ref<String> spokenForm(const Ref<Object>& element) {
  const Ref<String> label = labelOf(element);
  if (label) return label;
  return Ref<String>(cast<String>(element.get()));
}

struct SubhierarchyText {
  bool headers;
  bool focusableItems;
  const Ref<Array>& exclusions;
  Composition composition;

  bool isExcluded(const Ref<Object>& object) const {
    return exclusions && std::find(exclusions->begin(), exclusions->end(), object) != exclusions->end();
  }

  void addBelow(Object& parent, std::size_t level) {
    for (const Ref<Object>& child : drawnChildren(parent)) {
      if (!isWithinDepth(level)) return;
      if (_accessibilityViewIsVisible(child) && !isExcluded(child)) add(child, level);
    }
  }

  void add(const Ref<Object>& child, std::size_t level) {
    const bool isHeader = (messages::accessibilityTraits(child) & TraitHeader) != 0;
    const bool isFocusable = !isHeader && messages::isAccessibilityElement(child);
    if ((isHeader && !headers) || (isFocusable && !focusableItems)) return;
    const Ref<String> label = labelOf(child);
    if (isEmpty(label)) return addBelow(*child, level + 1);
    composition.add(label);
  }
};

}  // namespace

const Ref<String>& stringForVariablesSentinel = *new Ref<String>(string("__AXStringForVariablesSentinel"));

Ref<String> stringForVariables(std::initializer_list<Ref<String>> parts) {
  Composition composition;
  for (const Ref<String>& part : parts) {
    if (part && part->isEqual(*stringForVariablesSentinel)) break;
    composition.add(part);
  }
  return composition.result();
}

Ref<String> labelForElements(const Ref<Array>& elements) {
  Composition composition;
  if (elements) {
    for (const Ref<Object>& element : *elements) composition.add(spokenForm(element));
  }
  return composition.result();
}

Ref<String> labelForElements(std::initializer_list<Ref<Object>> elements) {
  return labelForElements(axArrayByIgnoringNilElementsWithCount(elements.size(), elements));
}

Ref<String> stringForAllChildren(Receiver view) {
  Composition composition;
  visitDescendants(view, [&](Object& child) {
    if (!_accessibilityViewIsVisible(child)) return false;
    if (!messages::isAccessibilityElement(child)) return true;
    composition.add(labelOf(Ref<Object>(&child)));
    return false;
  });
  return composition.result();
}

Ref<String> _accessibilityStringForLabelKeyValues(Receiver receiver, std::string_view keyList) {
  constexpr std::string_view between = ", ";
  Composition composition;
  while (!keyList.empty()) {
    const std::size_t end = std::min(keyList.find(between), keyList.size());
    composition.add(labelOf(safeValueForKey(receiver, Selector::find(keyList.substr(0, end)))));
    keyList.remove_prefix(std::min(end + between.size(), keyList.size()));
  }
  return composition.result();
}

Ref<String> _accessibilityTextForSubhierarchyIncludingHeadersFocusableItemsExclusions(
    Receiver receiver, bool headers, bool focusableItems, const Ref<Array>& exclusions) {
  SubhierarchyText text{headers, focusableItems, exclusions, {}};
  if (receiver.get() != nullptr) text.addBelow(*receiver.get(), 0);
  return text.composition.result();
}

}  // namespace ax
