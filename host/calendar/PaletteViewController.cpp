#include "host/calendar/PaletteViewController.h"

#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& PaletteViewController::staticClass() {
  using T = PaletteViewController;
  static Class& result = ClassBuilder<T>("PaletteViewController", ViewController::staticClass())
                             .instanceVariable<&T::paletteView_>("_paletteView")
                             .build();
  return result;
}

void PaletteViewController::viewDidLoad() {
  addUnplaced(*view(), {paletteView_});
}

static const RegisteredClass<PaletteViewController> registered;

}  // namespace ax::host
