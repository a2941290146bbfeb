#include "apps/view/model/Operating.h"

#include "platform/accessibility/Notifications.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/View.h"
#include "reader/snapshot/HostQuestions.h"
#include "reader/text/ReaderStrings.h"

namespace ax::view {

using reader::ActionResult;
using reader::readerText;

namespace {

const Message<bool()> performEscape{"accessibilityPerformEscape"};

// An argument that is a text is spoken; an object on the screen gets the focus.
std::string announced(ScreenModel& model, const PostedNotification& posted) {
  if (const String* text = cast<String>(posted.argument.get())) return text->text();
  const reader::Node* node = posted.argument ? model.snapshot().nodeOf(*posted.argument) : nullptr;
  if (node != nullptr) model.setFocus(model.itemOf(node->id));
  return readerText("layout.changed");
}

void tellWhatWentWrong(Effect& effect) {
  if (effect.result == ActionResult::gone) effect.announcements.push_back(readerText("element.gone"));
  if (effect.result == ActionResult::raised) effect.announcements.push_back(readerText("host.raised"));
  if (effect.result == ActionResult::notHandled || effect.result == ActionResult::unavailable) {
    effect.announcements.push_back(readerText("action.nothing"));
  }
}

template <class Work>
Effect effectOf(ScreenModel& model, Work&& work) {
  forgetReports();
  Effect effect;
  effect.result = work();
  const ItemId before = model.focus();
  effect.change = model.refresh();
  for (const PostedNotification& posted : postedNotifications()) {
    effect.announcements.push_back(announced(model, posted));
  }
  effect.change.isElsewhere = model.focus() != before;
  tellWhatWentWrong(effect);
  return effect;
}

ActionResult escape(const Ref<Object>& modal) {
  if (!modal) return ActionResult::gone;
  reader::HostQuestions questions;
  const ElementTest escapes = [&](Object& object) { return questions.ask(performEscape, object); };
  Ref<Object> escaped;
  questions.attempt([&] { escaped = _accessibilityFindAncestor(modal, escapes, true); });
  if (escaped) return ActionResult::done;
  View* view = cast<View>(modal.get());
  if (view == nullptr) return questions.raised() > 0 ? ActionResult::raised : ActionResult::notHandled;
  view->setHidden(true);
  return ActionResult::done;
}

}  // namespace

Effect operate(ScreenModel& model, reader::Action action, ItemId item) {
  return effectOf(model, [&] { return model.perform(action, item); });
}

Effect dismissModal(ScreenModel& model, ItemId item) {
  const Item* modal = model.find(model.modalAround(item));
  if (modal == nullptr) {
    Effect nothing;
    tellWhatWentWrong(nothing);
    return nothing;
  }
  const Ref<Object> object = model.snapshot().object(modal->node.id);
  return effectOf(model, [&] { return escape(object); });
}

}  // namespace ax::view
