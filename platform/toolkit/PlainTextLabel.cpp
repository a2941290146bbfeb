#include "platform/toolkit/PlainTextLabel.h"

#include "platform/foundation/AttributedString.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/AccessibilityProperties.h"

namespace ax {

namespace {

// Texts carry spoken forms, and nothing else of what responders do.
template <class T>
const Method* registerLabels() {
  ClassBuilder<T>(T::staticClass())
      .template method<&labelThatWasSet>("accessibilityLabel")
      .template method<&setLabel>("setAccessibilityLabel:")
      .template method<&labelThatWasSet>("accessibilityUserDefinedLabel");
  return T::staticClass().ownMethod(Selector::intern("accessibilityLabel"));
}

}  // namespace

const Method* const plainTextLabel = registerLabels<String>();
static const Method* const plainAttributedTextLabel = registerLabels<AttributedString>();

}  // namespace ax
