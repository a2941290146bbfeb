#pragma once

#include "platform/foundation/AttributedString.h"
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

 protected:
  bool defaultIsElement() override { return !isEmpty(text_); }
  Ref<String> defaultLabel() override;
  Traits defaultTraits() override { return TraitStaticText; }

 private:
  Ref<String> text_;
  Ref<AttributedString> attributedText_;
};

}  // namespace ax
