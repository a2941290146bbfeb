#include "platform/toolkit/View.h"

#include <algorithm>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

void layout(View& view) {
  view.layoutSubviews();
}

// The view itself when the point lies inside it; the point is in its own space.
Ref<Object> hitTest(View& view, Point point, Ref<Object>) {
  return view.bounds().contains(point) ? Ref<Object>(&view) : nullptr;
}

}  // namespace

Class& View::staticClass() {
  static Class& result = ClassBuilder<View>("View", Responder::staticClass())
                             .property<&View::frame, &View::setFrame>("frame")
                             .method<&View::accessibilityFrame>("accessibilityFrame")
                             .method<&View::bounds>("bounds")
                             .method<&View::center>("center")
                             .property<&View::isHidden, &View::setHidden>("hidden")
                             .method<&View::isHidden>("isHidden")
                             .property<&View::alpha, &View::setAlpha>("alpha")
                             .method<&View::subviewArray>("subviews")
                             .method<&View::layer>("layer")
                             .method<&layout>("layoutSubviews")
                             .method<&hitTest>("_accessibilityHitTest:withEvent:")
                             .build();
  return result;
}

View::~View() {
  for (const Ref<View>& view : subviews_) view->superview_ = nullptr;
  if (uncommon_ && uncommon_->layer) uncommon_->layer->setOwner(nullptr);
}

Ref<Array> View::subviewArray() const {
  return array({subviews_.begin(), subviews_.end()});
}

void View::addSubview(const Ref<View>& view) {
  if (!view || isDescendantOf(*view)) return;
  const Ref<View> kept(view.get());  // `view` may stand in the list that it is taken from
  kept->removeFromSuperview();
  kept->superview_ = this;
  subviews_.push_back(kept);
}

void View::removeFromSuperview() {
  if (superview_ == nullptr) return;
  const Ref<View> kept(this);
  auto& siblings = superview_->subviews_;
  siblings.erase(std::find(siblings.begin(), siblings.end(), kept));
  superview_ = nullptr;
}

bool View::isDescendantOf(const View& other) const {
  for (const View* view = this; view != nullptr; view = view->superview_) {
    if (view == &other) return true;
  }
  return false;
}

const Ref<Layer>& View::layer() {
  Ref<Layer>& layer = uncommon().layer;
  if (!layer) {
    layer = make<Layer>();
    layer->setOwner(this);
  }
  return layer;
}

View::Uncommon& View::uncommon() {
  if (!uncommon_) uncommon_ = std::make_unique<Uncommon>();
  return *uncommon_;
}

Rect View::screenRect(Rect own) const {
  Point at = {own.x, own.y};
  for (const View* view = this; view != nullptr; view = view->superview_) {
    at.x += view->frame_.x;
    at.y += view->frame_.y;
    if (!view->uncommon_) continue;
    at.x -= view->uncommon_->boundsOrigin.x;
    at.y -= view->uncommon_->boundsOrigin.y;
  }
  return {at.x, at.y, own.width, own.height};
}

Ref<View> safeUIViewForKey(Receiver receiver, Key key) {
  return cast<View>(safeValueForKey(receiver, key));
}

static const RegisteredClass<View> registered;

}  // namespace ax
