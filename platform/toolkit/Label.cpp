#include "platform/toolkit/Label.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Label::staticClass() {
  static Class& result = ClassBuilder<Label>("Label", View::staticClass())
                             .method<&Label::accessibilityLabel>("accessibilityLabel")
                             .method<&Label::accessibilityTraits>("accessibilityTraits")
                             .property<&Label::text, &Label::setText>("text")
                             .property<&Label::attributedText, &Label::setAttributedText>("attributedText")
                             .build();
  return result;
}

void Label::setText(Ref<String> text) {
  text_ = std::move(text);
  attributedText_ = nullptr;
}

void Label::setAttributedText(Ref<AttributedString> text) {
  text_ = text ? text->string() : nullptr;
  attributedText_ = std::move(text);
}

Ref<String> Label::defaultLabel() {
  if (Ref<String> spoken = messages::accessibilityLabel(attributedText_)) return spoken;
  if (Ref<String> spoken = messages::accessibilityLabel(text_)) return spoken;
  return text_;
}

static const RegisteredClass<Label> registered;

}  // namespace ax
