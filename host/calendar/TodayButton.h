#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// Puts the button that leads to today, a picture without words, into a controller's navigation item, unless
// something stands there.
inline void showTodayButton(ViewController& controller) {
  const Ref<NavigationItem> item = controller.navigationItem();
  if (!item->rightBarButtonItem()) item->setRightBarButtonItem(make<BarButtonItem>());
}

}  // namespace ax::host
