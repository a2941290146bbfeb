#pragma once

#include "platform/foundation/String.h"
#include "platform/toolkit/AccessibilityMessages.h"

namespace ax {

// The entry by which texts answer accessibilityLabel: with the spoken form that was set on them, if one was.
extern const Method* const plainTextLabel;

// Whether it is known that a text speaks nothing but itself: nothing was set on it, and nobody overrides its
// label. False also before the label of any such text was asked for.
inline bool speaksItself(const String& text) {
  return !text.hasAttachments() && text.isa().isKnownToAnswerWith(*plainTextLabel);
}

}  // namespace ax
