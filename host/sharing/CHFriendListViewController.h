#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The list of friends. A button in the navigation bar shows the order that is chosen and opens the others.
class CHFriendListViewController : public ViewController {
 public:
  static Class& staticClass();

  // Puts the sort button into the navigation bar.
  void viewDidLoad() override;
  // Another order was picked; it becomes the sort button's title.
  void sortOrderPicked(Ref<String> name);

 private:
  Ref<BarButtonItem> sortBarButtonItem_;
};

}  // namespace ax::host
