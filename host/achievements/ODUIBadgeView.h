#pragma once

#include "platform/toolkit/ImageView.h"

namespace ax::host {

// The badge of an achievement. Its image says what the badge shows.
class ODUIBadgeView : public View {
 public:
  static Class& staticClass();

  const Ref<Image>& image() const { return image_; }
  void setImage(Ref<Image> image) { image_ = std::move(image); }

 protected:
  bool defaultIsElement() override { return true; }
  Ref<String> defaultLabel() override { return messages::accessibilityLabel(image_); }
  Traits defaultTraits() override { return TraitImage; }

 private:
  Ref<Image> image_;
};

}  // namespace ax::host
