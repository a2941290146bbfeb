#include "platform/toolkit/ViewController.h"

#include <array>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

void load(ViewController& controller) {
  controller.loadView();
}
void didLoad(ViewController& controller) {
  controller.viewDidLoad();
}

}  // namespace

Class& BarButtonItem::staticClass() {
  using T = BarButtonItem;
  static Class& result = ClassBuilder<T>("BarButtonItem", Responder::staticClass())
                             .property<&T::title, &T::setTitle>("title")
                             .property<&T::action, &T::setAction>("action")
                             .property<&T::target, &T::setTarget>("target")
                             .build();
  return result;
}

bool BarButtonItem::activateByDefault() {
  const Ref<Object> receiver = target_.lock();
  if (!receiver || !action_) return false;
  const Method& method = receiver->isa().lookUp(action_);
  if (method.function == nullptr) return false;
  method.signature->invoke(*receiver, method, std::array{Ref<Object>(this)});
  return true;
}

Class& NavigationItem::staticClass() {
  using T = NavigationItem;
  static Class& result =
      ClassBuilder<T>("NavigationItem", Object::staticClass())
          .property<&T::title, &T::setTitle>("title")
          .property<&T::leftBarButtonItems, &T::setLeftBarButtonItems>("leftBarButtonItems")
          .property<&T::rightBarButtonItems, &T::setRightBarButtonItems>("rightBarButtonItems")
          .property<&T::rightBarButtonItem, &T::setRightBarButtonItem>("rightBarButtonItem")
          .build();
  return result;
}

Ref<BarButtonItem> NavigationItem::rightBarButtonItem() const {
  return right_ ? cast<BarButtonItem>(right_->firstObject()) : nullptr;
}

void NavigationItem::setRightBarButtonItem(Ref<BarButtonItem> item) {
  right_ = axArrayByIgnoringNilElementsWithCount(1, {item});
}

Class& ViewController::staticClass() {
  using T = ViewController;
  static Class& result = ClassBuilder<T>("ViewController", Responder::staticClass())
                             .property<&T::view, &T::setView>("view")
                             .property<&T::title, &T::setTitle>("title")
                             .property<&T::navigationItem, &T::setNavigationItem>("navigationItem")
                             .method<&load>("loadView")
                             .method<&didLoad>("viewDidLoad")
                             .build();
  return result;
}

const Ref<View>& ViewController::view() {
  if (!view_) loadView();
  return view_;
}

const Ref<NavigationItem>& ViewController::navigationItem() {
  if (!navigationItem_) navigationItem_ = make<NavigationItem>();
  return navigationItem_;
}

void ViewController::loadView() {
  if (!view_) view_ = make<View>();
}

static const RegisteredClass<BarButtonItem> registeredItem;
static const RegisteredClass<NavigationItem> registeredNavigationItem;
static const RegisteredClass<ViewController> registered;

}  // namespace ax
