#include "host/calendar/DayPagingViewController.h"

#include "host/calendar/TodayButton.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& DayPagingViewController::staticClass() {
  static Class& result =
      ClassBuilder<DayPagingViewController>("DayPagingViewController", ViewController::staticClass()).build();
  return result;
}

void DayPagingViewController::viewDidLoad() {
  showTodayButton(*this);
}

static const RegisteredClass<DayPagingViewController> registered;

}  // namespace ax::host
