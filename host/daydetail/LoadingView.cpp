#include "host/daydetail/LoadingView.h"

#include "host/core/HostStrings.h"
#include "host/core/Layout.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& LoadingView::staticClass() {
  static Class& result = ClassBuilder<LoadingView>("LoadingView", View::staticClass())
                             .instanceVariable<&LoadingView::label_>("_label")
                             .build();
  return result;
}

void LoadingView::layoutSubviews() {
  if (!label_) {
    label_ = make<Label>();
    label_->setText(hostText("loading"));
    label_->setFrame({0, frame().height / 2, frame().width, 20});
  }
  addUnplaced(*this, {label_});
}

static const RegisteredClass<LoadingView> registered;

}  // namespace ax::host
