#pragma once

#include "platform/toolkit/View.h"

namespace ax {

// A picture; its spoken form is what is set on it.
class Image : public Responder {
 public:
  static Class& staticClass();

  const Ref<String>& name() const { return name_; }
  void setName(Ref<String> name) { name_ = std::move(name); }

 private:
  Ref<String> name_;
};

class ImageView : public View {
 public:
  static Class& staticClass();

  const Ref<Image>& image() const { return image_; }
  void setImage(Ref<Image> image) { image_ = std::move(image); }

 protected:
  Ref<String> defaultLabel() override { return messages::accessibilityLabel(image_); }
  Traits defaultTraits() override { return TraitImage; }

 private:
  Ref<Image> image_;
};

}  // namespace ax
