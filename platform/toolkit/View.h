#pragma once

#include <vector>

#include "platform/toolkit/Layer.h"
#include "platform/toolkit/Responder.h"

namespace ax {

// A rectangle on the screen that holds others. A view owns its subviews; they know it without owning it.
// Frames are in the superview's space; a view without a superview stands in screen space.
class View : public Responder {
 public:
  static Class& staticClass();
  ~View() override;

  Rect frame() const { return frame_; }
  void setFrame(Rect frame) { frame_ = frame; }
  // Where the view's own space begins: other than zero where the view shows a part of it.
  Point boundsOrigin() const { return boundsOrigin_; }
  void setBoundsOrigin(Point origin) { boundsOrigin_ = origin; }
  Rect bounds() const { return {boundsOrigin().x, boundsOrigin().y, frame_.width, frame_.height}; }
  Point center() const { return frame_.center(); }

  bool isHidden() const { return isHidden_; }
  void setHidden(bool hidden) { isHidden_ = hidden; }
  double alpha() const { return alpha_; }
  void setAlpha(double alpha) { alpha_ = alpha; }

  View* superview() const { return superview_; }
  const std::vector<Ref<View>>& subviews() const { return subviews_; }
  Ref<Array> subviewArray() const;
  void addSubview(const Ref<View>& view);
  void removeFromSuperview();
  bool isDescendantOf(const View& other) const;

  // The view's own layer, made at first use. Its sublayers are drawn in the view's space.
  const Ref<Layer>& layer();
  const Layer* layerIfAny() const { return layer_.get(); }

  virtual void layoutSubviews() {}

  Rect screenRect(Rect own) const final;

 protected:
  Rect defaultFrame() override { return screenRect(bounds()); }
  Ref<Object> defaultContainer() override { return Ref<Object>(superview_); }

 private:
  Rect frame_;
  Point boundsOrigin_;
  View* superview_ = nullptr;
  std::vector<Ref<View>> subviews_;
  Ref<Layer> layer_;
  double alpha_ = 1;
  bool isHidden_ = false;
};

}  // namespace ax
