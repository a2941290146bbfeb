#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The day screen, which pages from day to day, with a button that leads to today.
class DayPagingViewController : public ViewController {
 public:
  static Class& staticClass();

  void viewDidLoad() override;
};

}  // namespace ax::host
