#include "host/sharing/MessageButton.h"

#include "host/core/HostStrings.h"

namespace ax::host {

void addMessageButton(ViewController& controller) {
  if (controller.navigationItem()->rightBarButtonItems()) return;
  const Ref<BarButtonItem> button = make<BarButtonItem>();
  button->setTitle(hostText("friends.messages.short"));
  button->setTarget(Ref<Object>(&controller));
  button->setAction(selectorFromString("_sendMessageButtonTapped:"));
  controller.navigationItem()->setRightBarButtonItem(button);
}

}  // namespace ax::host
