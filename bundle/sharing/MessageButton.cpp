#include "bundle/sharing/MessageButton.h"

#include "bundle/shared/LocalizedString.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

void nameMessageButton(Object& controller) {
  const Ref<ViewController> screen = castAsClass<ViewController>(controller);
  const Ref<Array> items = screen ? screen->navigationItem()->rightBarButtonItems() : nullptr;
  if (!items) return;
  for (const Ref<Object>& object : *items) {
    const auto* item = cast<BarButtonItem>(object.get());
    if (item == nullptr || item->action() != "_sendMessageButtonTapped:"_key) continue;
    messages::setAccessibilityLabel(object, accessibilityLocalizedString("messages"));
    messages::setAccessibilityHint(object, accessibilityLocalizedString("messages.hint"));
    return;
  }
}

}  // namespace ax
