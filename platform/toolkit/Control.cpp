#include "platform/toolkit/Control.h"

#include <algorithm>
#include <array>

#include "platform/foundation/Bundle.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

void nextPage(PageControl& control) {
  control.setCurrentPage(control.currentPage() + 1);
}
void previousPage(PageControl& control) {
  control.setCurrentPage(control.currentPage() - 1);
}

}  // namespace

Class& Control::staticClass() {
  static Class& result = ClassBuilder<Control>("Control", View::staticClass())
                             .property<&Control::isEnabled, &Control::setEnabled>("enabled")
                             .property<&Control::isSelected, &Control::setSelected>("selected")
                             .property<&Control::target, &Control::setTarget>("target")
                             .property<&Control::action, &Control::setAction>("action")
                             .build();
  return result;
}

void Control::setTargetAction(Weak<Object> target, Selector action) {
  target_ = std::move(target);
  action_ = action;
}

bool Control::sendAction() {
  const Ref<Object> target = target_.lock();
  if (!isEnabled_ || !target || !action_) return false;
  const Method& method = target->isa().lookUp(action_);
  if (method.function == nullptr) return false;
  method.signature->invoke(*target, method, std::array{Ref<Object>(this)});
  return true;
}

Class& Button::staticClass() {
  static Class& result = ClassBuilder<Button>("Button", Control::staticClass())
                             .property<&Button::title, &Button::setTitle>("title")
                             .build();
  return result;
}

Ref<String> Button::defaultLabel() {
  if (Ref<String> spoken = messages::accessibilityLabel(title_)) return spoken;
  return title_;
}

bool Button::activateByDefault() {
  sendAction();
  return isEnabled();
}

Class& PageControl::staticClass() {
  static Class& result =
      ClassBuilder<PageControl>("PageControl", Control::staticClass())
          .property<&PageControl::numberOfPages, &PageControl::setNumberOfPages>("numberOfPages")
          .property<&PageControl::currentPage, &PageControl::setCurrentPage>("currentPage")
          .method<&nextPage>("accessibilityIncrement")
          .method<&previousPage>("accessibilityDecrement")
          .build();
  return result;
}

void PageControl::setCurrentPage(std::int64_t page) {
  currentPage_ = std::clamp<std::int64_t>(page, 0, std::max<std::int64_t>(numberOfPages_ - 1, 0));
}

void PageControl::setNumberOfPages(std::int64_t pages) {
  numberOfPages_ = std::max<std::int64_t>(pages, 0);
  setCurrentPage(currentPage_);
}

Ref<String> PageControl::defaultValue() {
  return stringWithFormat(platformString("page.control.value"),
                          {number(currentPage_ + 1), number(numberOfPages_)});
}

static const RegisteredClass<Control> registeredControl;
static const RegisteredClass<Button> registeredButton;
static const RegisteredClass<PageControl> registeredPageControl;

}  // namespace ax
