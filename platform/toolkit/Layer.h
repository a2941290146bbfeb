#pragma once

#include <vector>

#include "platform/toolkit/Responder.h"

namespace ax {

class View;

// Something drawn inside a view that is no view itself. A layer owns its sublayers; a view's own layer knows
// the view. A layer's frame is in the space of its superlayer, or of the view whose own layer holds it.
class Layer : public Responder {
 public:
  static Class& staticClass();
  ~Layer() override;

  Rect frame() const { return frame_; }
  void setFrame(Rect frame) { frame_ = frame; }
  double opacity() const { return opacity_; }
  void setOpacity(double opacity) { opacity_ = opacity; }
  bool isHidden() const { return isHidden_; }
  void setHidden(bool hidden) { isHidden_ = hidden; }

  const std::vector<Ref<Layer>>& sublayers() const { return sublayers_; }
  // Takes the layer out of another one first. Nothing happens to a layer that this one lies in.
  void addSublayer(const Ref<Layer>& layer);
  void removeFromSuperlayer();
  Layer* superlayer() const { return superlayer_; }
  // The view whose own layer this is, or nil.
  View* owner() const { return owner_; }
  void setOwner(View* owner) { owner_ = owner; }

  Rect screenRect(Rect own) const override;

 protected:
  Rect defaultFrame() override;
  Ref<Object> defaultContainer() override;

 private:
  Ref<Array> sublayerArray() const;

  Rect frame_;
  double opacity_ = 1;
  bool isHidden_ = false;
  Layer* superlayer_ = nullptr;
  View* owner_ = nullptr;
  std::vector<Ref<Layer>> sublayers_;
};

}  // namespace ax
