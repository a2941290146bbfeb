#pragma once

#include "host/calendar/PaletteWeekdayHeaderView.h"
#include "platform/toolkit/ViewController.h"

namespace ax::host {

// The week palette over the day screen.
class PaletteViewController : public ViewController {
 public:
  static Class& staticClass();

  // Puts the weekday header into the palette's view.
  void viewDidLoad() override;

 private:
  Ref<PaletteWeekdayHeaderView> paletteView_;
};

}  // namespace ax::host
