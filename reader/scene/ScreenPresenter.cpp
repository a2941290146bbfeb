#include "reader/scene/ScreenPresenter.h"

#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/ViewController.h"
#include "reader/scene/Raised.h"

namespace ax::reader {

template <class M>
void ScreenPresenter::send(const M& message, const Ref<Object>& receiver) {
  const auto raised = raisedBy([&] { message(receiver); });
  if (!raised) return;
  hostFaults_.push_back(receiver->isa().name() + " " + std::string(message.selector().name()) + ": " +
                        *raised);
}

void ScreenPresenter::present(const Ref<Object>& screen) {
  const bool isController = cast<ViewController>(screen.get()) != nullptr;
  if (isController) {
    send(messages::loadView, screen);
    send(messages::viewDidLoad, screen);
  }
  const Ref<View> view = isController ? safeUIViewForKey(screen, "view"_key) : cast<View>(screen);
  if (view) {
    layOut(view, 0);
    loadAccessibility(view, 0);
  }
  if (isController) send(messages::_accessibilityLoadAccessibilityInformation, screen);
}

void ScreenPresenter::layOut(const Ref<View>& view, std::size_t level) {
  if (!isWithinDepth(level)) return;
  send(messages::layoutSubviews, view);
  const std::vector<Ref<View>> children = view->subviews();
  for (const Ref<View>& child : children) layOut(child, level + 1);
}

void ScreenPresenter::loadAccessibility(const Ref<View>& view, std::size_t level) {
  if (!isWithinDepth(level)) return;
  const std::vector<Ref<View>> children = view->subviews();
  for (const Ref<View>& child : children) loadAccessibility(child, level + 1);
  send(messages::_accessibilityLoadAccessibilityInformation, view);
}

}  // namespace ax::reader
