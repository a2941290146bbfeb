#include "apps/axvelto/NodeActions.h"

#include <optional>

#include "apps/axvelto/Output.h"
#include "apps/shared/Complaint.h"
#include "platform/accessibility/Notifications.h"
#include "reader/snapshot/HostQuestions.h"
#include "reader/speech/SpokenLine.h"
#include "reader/text/ReaderStrings.h"
#include "reader/transcript/Transcript.h"

namespace ax::app {

using namespace reader;

namespace {

struct WantedAction {
  Action action;
  std::string target;
};

std::optional<WantedAction> wantedAction(const Arguments& arguments) {
  if (!arguments.activate.empty()) return WantedAction{Action::activate, arguments.activate};
  if (!arguments.increment.empty()) return WantedAction{Action::increment, arguments.increment};
  if (!arguments.decrement.empty()) return WantedAction{Action::decrement, arguments.decrement};
  return std::nullopt;
}

const Node* findNode(const Snapshot& snapshot, const std::string& labelOrId) {
  for (const Node& node : snapshot.nodes()) {
    if (node.objectId == labelOrId) return &node;
  }
  for (const Node& node : snapshot.nodes()) {
    if (node.isElement && node.label && node.label->text == labelOrId) return &node;
  }
  return nullptr;
}

// The screen as it is spoken, before and after.
struct Change {
  std::vector<std::string> before, after;

  bool goesBeyond(const std::string& line) const {
    if (before.size() != after.size()) return true;
    for (std::size_t i = 0; i < after.size(); ++i) {
      if (before[i] != after[i] && after[i] != line) return true;
    }
    return false;
  }
};

void printOutcome(ShownScene& shown, const Snapshot& before, const Ref<Object>& acted) {
  const std::string& title = shown.run().title();
  const Snapshot after = shown.snapshot();
  const Change change{transcript(before, title), transcript(after, title)};
  const Node* node = after.nodeOf(*acted);
  const std::string line = node == nullptr ? readerText("element.gone") : spokenLine(*node);
  printText(line);
  for (std::size_t i = 0; i < postedNotifications().size(); ++i) {
    std::cout << readerText("layout.changed") << '\n';
  }
  if (change.goesBeyond(line) || !postedNotifications().empty()) print(change.after);
}

std::string actionsOf(const Node& node) {
  std::string names;
  for (const Action action : {Action::activate, Action::increment, Action::decrement}) {
    if (node.actions.has(action)) names += (names.empty() ? "" : " or ") + std::string(actionName(action));
  }
  return names.empty() ? "an element that can be operated" : names;
}

// What went wrong, for results other than `done`.
ExitCode fail(ActionResult result, const WantedAction& wanted, const Node& node, const std::string& file) {
  const std::string of = std::string(actionName(wanted.action)) + " of \"" + wanted.target + "\"";
  if (result == ActionResult::unavailable) {
    complain(Fault{file, "", "no " + of, actionsOf(node)});
  } else if (result == ActionResult::raised) {
    complain(Fault{file, "", "the host raised in " + of, "an answer"});
  } else {
    std::cout << readerText(result == ActionResult::gone ? "element.gone" : "action.nothing") << '\n';
  }
  return exitFallsShort;
}

ExitCode act(ShownScene& shown, const WantedAction& wanted) {
  const std::string& file = shown.scene().file;
  const Snapshot before = shown.snapshot();
  const Node* node = findNode(before, wanted.target);
  if (node == nullptr) {
    throw Fault{file, "the screen", "no element \"" + wanted.target + "\"", "a label or an id"};
  }
  const Ref<Object> acted = before.object(node->id);
  forgetReports();
  const ActionResult result = before.perform(wanted.action, node->id);
  if (result != ActionResult::done) return fail(result, wanted, *node, file);
  printOutcome(shown, before, acted);
  return exitDone;
}

ExitCode speakAt(ShownScene& shown, Point point) {
  const Snapshot snapshot = shown.snapshot();
  HostQuestions questions;
  const Node* node = snapshot.hitTest(point, questions);
  shown.tellOf(questions.raised());
  printText(node == nullptr ? readerText("screen.empty") : spokenLine(*node));
  return node == nullptr ? exitFallsShort : exitDone;
}

}  // namespace

bool isNodeAction(const Arguments& arguments) {
  return !arguments.point.empty() || wantedAction(arguments);
}

ExitCode runNodeAction(ShownScene& shown, const Arguments& arguments) {
  if (const std::optional<WantedAction> wanted = wantedAction(arguments)) return act(shown, *wanted);
  return speakAt(shown, {arguments.point[0], arguments.point[1]});
}

}  // namespace ax::app
