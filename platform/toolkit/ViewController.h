#pragma once

#include "platform/toolkit/View.h"

namespace ax {

// A button of the navigation bar.
class BarButtonItem : public Responder {
 public:
  static Class& staticClass();

  const Ref<String>& title() const { return title_; }
  void setTitle(Ref<String> title) { title_ = std::move(title); }
  Selector action() const { return action_; }
  void setAction(Selector action) { action_ = action; }
  Ref<Object> target() const { return target_.lock(); }
  void setTarget(Ref<Object> target) { target_ = target; }

 protected:
  bool defaultIsElement() override { return !isEmpty(messages::accessibilityLabel(*this)); }
  Ref<String> defaultLabel() override { return title_; }
  Traits defaultTraits() override { return TraitButton; }
  bool activateByDefault() override;

 private:
  Ref<String> title_;
  Selector action_;
  Weak<Object> target_;
};

// What a screen puts into the navigation bar. The right items are listed from the edge inward.
class NavigationItem : public Object {
 public:
  static Class& staticClass();

  const Ref<String>& title() const { return title_; }
  void setTitle(Ref<String> title) { title_ = std::move(title); }
  const Ref<Array>& leftBarButtonItems() const { return left_; }
  void setLeftBarButtonItems(Ref<Array> items) { left_ = std::move(items); }
  const Ref<Array>& rightBarButtonItems() const { return right_; }
  void setRightBarButtonItems(Ref<Array> items) { right_ = std::move(items); }
  // The first of the right items, or nil.
  Ref<BarButtonItem> rightBarButtonItem() const;
  void setRightBarButtonItem(Ref<BarButtonItem> item);

 private:
  Ref<String> title_;
  Ref<Array> left_;
  Ref<Array> right_;
};

// One screen: its view, and what it puts into the navigation bar.
class ViewController : public Responder {
 public:
  static Class& staticClass();

  // Loaded at first use.
  const Ref<View>& view();
  void setView(Ref<View> view) { view_ = std::move(view); }
  const Ref<String>& title() const { return title_; }
  void setTitle(Ref<String> title) { title_ = std::move(title); }
  const Ref<NavigationItem>& navigationItem();
  void setNavigationItem(Ref<NavigationItem> item) { navigationItem_ = std::move(item); }

  // Makes the view when there is none yet.
  virtual void loadView();
  virtual void viewDidLoad() {}

 private:
  Ref<View> view_;
  Ref<String> title_;
  Ref<NavigationItem> navigationItem_;
};

}  // namespace ax
