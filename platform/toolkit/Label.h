#pragma once

#include "platform/foundation/AttributedString.h"
#include "platform/toolkit/PlainTextLabel.h"
#include "platform/toolkit/View.h"

namespace ax {

// Shows a text, plain or styled. It speaks the spoken form that its text carries, else the text.
class Label : public View {
 public:
  static Class& staticClass();

  const Ref<String>& text() const { return text_; }
  void setText(Ref<String> text);
  const Ref<AttributedString>& attributedText() const { return attributedText_; }
  void setAttributedText(Ref<AttributedString> text);
  // Straight to the text where nothing was set: most of what a screen reader asks is plain labels.
  Ref<String> accessibilityLabel() {
    if (!isPlain()) [[unlikely]]
      return richLabel();
    return text_;
  }
  Traits accessibilityTraits() {
    return hasAttachments() ? Responder::accessibilityTraits() : Label::defaultTraits();
  }

 protected:
  bool defaultIsElement() override { return !isEmpty(text_); }
  Ref<String> defaultLabel() final;
  Traits defaultTraits() final { return TraitStaticText; }

 private:
  // Apart, so that plain labels pay nothing for it.
  [[gnu::cold, gnu::noinline]] Ref<String> richLabel() { return Responder::accessibilityLabel(); }
  bool isPlain() const { return !hasAttachments() && !attributedText_ && text_ && speaksItself(*text_); }

  Ref<String> text_;
  Ref<AttributedString> attributedText_;
};

}  // namespace ax
