#pragma once

#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The history screen: the months, with a button that leads to today.
class MonthViewController : public ViewController {
 public:
  static Class& staticClass();

  void viewDidLoad() override;
};

// The scrolling part of it.
class MonthScrollViewController : public ViewController {
 public:
  static Class& staticClass();

  // Puts the scroll view into the screen's view.
  void viewDidLoad() override;

 private:
  Ref<ScrollView> scrollView_;
};

}  // namespace ax::host
