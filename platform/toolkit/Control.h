#pragma once

#include "platform/toolkit/View.h"

namespace ax {

// Something that the user operates.
class Control : public View {
 public:
  static Class& staticClass();

  bool isEnabled() const { return isEnabled_; }
  void setEnabled(bool enabled) { isEnabled_ = enabled; }
  bool isSelected() const { return isSelected_; }
  void setSelected(bool selected) { isSelected_ = selected; }
  // Who is told, with the control as the one argument, when the control is operated. Held weakly.
  void setTargetAction(Weak<Object> target, Selector action);
  Ref<Object> target() const { return target_.lock(); }
  void setTarget(Ref<Object> target) { target_ = target; }
  Selector action() const { return action_; }
  void setAction(Selector action) { action_ = action; }
  // False when the control is disabled or nobody takes the action.
  bool sendAction();

 protected:
  bool defaultIsElement() override { return true; }
  Traits defaultTraits() override {
    return (isEnabled_ ? 0 : TraitNotEnabled) | (isSelected_ ? TraitSelected : 0);
  }

 private:
  Weak<Object> target_;
  Selector action_;
  bool isEnabled_ = true;
  bool isSelected_ = false;
};

// A titled control. Without a title or a label it is no element.
class Button : public Control {
 public:
  static Class& staticClass();

  const Ref<String>& title() const { return title_; }
  void setTitle(Ref<String> title) { title_ = std::move(title); }

 protected:
  bool defaultIsElement() override { return !isEmpty(messages::accessibilityLabel(*this)); }
  Ref<String> defaultLabel() override;
  Traits defaultTraits() override { return Control::defaultTraits() | TraitButton; }
  bool activateByDefault() override;

 private:
  Ref<String> title_;
};

// Chooses one of several pages, counted from 0.
class PageControl : public Control {
 public:
  static Class& staticClass();

  std::int64_t currentPage() const { return currentPage_; }
  // Kept between the first and the last page.
  void setCurrentPage(std::int64_t page);
  std::int64_t numberOfPages() const { return numberOfPages_; }
  void setNumberOfPages(std::int64_t pages);

 protected:
  Ref<String> defaultValue() override;
  Traits defaultTraits() override { return Control::defaultTraits() | TraitAdjustable; }

 private:
  std::int64_t currentPage_ = 0;
  std::int64_t numberOfPages_ = 0;
};

}  // namespace ax
