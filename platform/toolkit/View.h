#pragma once

#include <memory>
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
  Point boundsOrigin() const { return uncommon_ ? uncommon_->boundsOrigin : Point(); }
  void setBoundsOrigin(Point origin) { uncommon().boundsOrigin = origin; }
  Rect bounds() const { return {boundsOrigin().x, boundsOrigin().y, frame_.width, frame_.height}; }
  Point center() const { return frame_.center(); }

  bool isHidden() const { return isHidden_; }
  void setHidden(bool hidden) { isHidden_ = hidden; }
  double alpha() const { return uncommon_ ? uncommon_->alpha : 1; }
  void setAlpha(double alpha) { uncommon().alpha = alpha; }

  View* superview() const { return superview_; }
  const std::vector<Ref<View>>& subviews() const { return subviews_; }
  Ref<Array> subviewArray() const;
  void addSubview(const Ref<View>& view);
  void removeFromSuperview();
  bool isDescendantOf(const View& other) const;

  // The view's own layer, made at first use. Its sublayers are drawn in the view's space.
  const Ref<Layer>& layer();
  const Layer* layerIfAny() const { return uncommon_ ? uncommon_->layer.get() : nullptr; }

  virtual void layoutSubviews() {}
  // Whether the view and its parts change sides in a language that is written from the right.
  virtual bool changesSides() const { return true; }

  Rect screenRect(Rect own) const final;
  // Straight to the default where nothing was set: this is asked of every view there is.
  Rect accessibilityFrame() {
    if (hasAttachments()) [[unlikely]]
      return Responder::accessibilityFrame();
    return View::defaultFrame();
  }

 protected:
  Rect defaultFrame() final { return superview_ == nullptr ? frame_ : superview_->screenRect(frame_); }
  Ref<Object> defaultContainer() override { return Ref<Object>(superview_); }

 private:
  // What few views have something of; the others stay small without it.
  struct Uncommon {
    Point boundsOrigin;
    double alpha = 1;
    Ref<Layer> layer;
  };
  Uncommon& uncommon();

  bool isHidden_ = false;
  Rect frame_;
  View* superview_ = nullptr;
  std::vector<Ref<View>> subviews_;
  std::unique_ptr<Uncommon> uncommon_;
};

}  // namespace ax
