#include "bundle/sharing/MessageButton.h"

#include "bundle/shared/LocalizedString.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/ToolkitMessages.h"
#include "platform/toolkit/ViewController.h"

namespace ax {

void nameMessageButton(Object& controller) {
  const Ref<ViewController> screen = castAsClass<ViewController>(controller);
  const Ref<Array> items = messages::rightBarButtonItems(messages::navigationItem(screen));
  if (!items) return;
  for (const Ref<Object>& object : *items) {
    const Ref<BarButtonItem> item = cast<BarButtonItem>(object);
    if (messages::action(item) != "_sendMessageButtonTapped:"_key) continue;
    messages::setAccessibilityLabel(item, accessibilityLocalizedString("messages"));
    messages::setAccessibilityHint(item, accessibilityLocalizedString("messages.hint"));
    return;
  }
}

}  // namespace ax
