#include "host/calendar/MonthViewController.h"

#include "host/calendar/TodayButton.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& MonthViewController::staticClass() {
  static Class& result =
      ClassBuilder<MonthViewController>("MonthViewController", ViewController::staticClass()).build();
  return result;
}

void MonthViewController::viewDidLoad() {
  showTodayButton(*this);
}

Class& MonthScrollViewController::staticClass() {
  using T = MonthScrollViewController;
  static Class& result = ClassBuilder<T>("MonthScrollViewController", ViewController::staticClass())
                             .instanceVariable<&T::scrollView_>("_scrollView")
                             .build();
  return result;
}

void MonthScrollViewController::viewDidLoad() {
  addUnplaced(*view(), {scrollView_});
}

static const RegisteredClass<MonthViewController> registered;
static const RegisteredClass<MonthScrollViewController> registeredScroll;

}  // namespace ax::host
