#include "platform/toolkit/Layer.h"

#include <algorithm>

#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/View.h"

namespace ax {

Class& Layer::staticClass() {
  static Class& result = ClassBuilder<Layer>("Layer", Responder::staticClass())
                             .property<&Layer::frame, &Layer::setFrame>("frame")
                             .property<&Layer::opacity, &Layer::setOpacity>("opacity")
                             .property<&Layer::opacity, &Layer::setOpacity>("alpha")
                             .property<&Layer::isHidden, &Layer::setHidden>("hidden")
                             .method<&Layer::sublayerArray>("sublayers")
                             .build();
  return result;
}

Layer::~Layer() {
  for (const Ref<Layer>& layer : sublayers_) layer->superlayer_ = nullptr;
}

Ref<Array> Layer::sublayerArray() const {
  return array({sublayers_.begin(), sublayers_.end()});
}

void Layer::addSublayer(const Ref<Layer>& layer) {
  if (!layer) return;
  for (const Layer* above = this; above != nullptr; above = above->superlayer_) {
    if (above == layer.get()) return;
  }
  const Ref<Layer> kept(layer.get());  // `layer` may stand in the list that it is taken from
  kept->removeFromSuperlayer();
  kept->superlayer_ = this;
  sublayers_.push_back(kept);
}

void Layer::removeFromSuperlayer() {
  if (superlayer_ == nullptr) return;
  const Ref<Layer> kept(this);
  auto& siblings = superlayer_->sublayers_;
  siblings.erase(std::find(siblings.begin(), siblings.end(), kept));
  superlayer_ = nullptr;
}

Rect Layer::screenRect(Rect own) const {
  for (const Layer* layer = this; layer != nullptr; layer = layer->superlayer_) {
    if (layer->owner_ != nullptr) return layer->owner_->screenRect(own);
    own = own.movedBy({layer->frame_.x, layer->frame_.y});
  }
  return own;
}

Rect Layer::defaultFrame() {
  return screenRect({0, 0, frame_.width, frame_.height});
}

Ref<Object> Layer::defaultContainer() {
  if (owner_ != nullptr) return Ref<Object>(owner_);
  return Ref<Object>(superlayer_);
}

static const RegisteredClass<Layer> registered;

}  // namespace ax
