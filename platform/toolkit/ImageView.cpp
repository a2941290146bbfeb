#include "platform/toolkit/ImageView.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& Image::staticClass() {
  static Class& result = ClassBuilder<Image>("Image", Responder::staticClass())
                             .property<&Image::name, &Image::setName>("name")
                             .build();
  return result;
}

Class& ImageView::staticClass() {
  static Class& result = ClassBuilder<ImageView>("ImageView", View::staticClass())
                             .property<&ImageView::image, &ImageView::setImage>("image")
                             .build();
  return result;
}

static const RegisteredClass<Image> registeredImage;
static const RegisteredClass<ImageView> registered;

}  // namespace ax
