#include "reader/snapshot/ShownContent.h"

#include "platform/toolkit/Control.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/Label.h"
#include "platform/toolkit/ScrollView.h"
#include "platform/toolkit/TreeDepth.h"
#include "platform/toolkit/ViewController.h"
#include "reader/snapshot/HostQuestions.h"

namespace ax::reader {

namespace {

struct TextMember {
  Class& (*ofClass)();
  Key key;
};

// Where the toolkit's classes keep the text that they draw; the first that there is counts.
const TextMember textMembers[] = {{&Label::staticClass, "attributedText"_key},
                                  {&Label::staticClass, "text"_key},
                                  {&Button::staticClass, "title"_key}};

class ContentReading {
 public:
  explicit ContentReading(const ObjectNames& names) : names_(names) {}

  void readTexts(Object& object, std::size_t depth) {
    bool isVisible = false;
    questions_.attempt([&] { isVisible = _accessibilityViewIsVisible(object); });
    if (!isWithinDepth(depth) || !isVisible) return;
    addText(object);
    for (const Ref<Object>& child : drawnChildren(object)) readTexts(*child, depth + 1);
  }

  Rect frameOf(Receiver object) { return questions_.ask(messages::accessibilityFrame, object); }

  bool liesInScrollView(Receiver object) {
    bool lies = false;
    questions_.attempt(
        [&] { lies = _accessibilityAncestorIsKindOf(object, &ScrollView::staticClass()) != nullptr; });
    return lies;
  }

  bool staysAround(Receiver object) {
    bool stays = false;
    questions_.attempt([&] {
      const auto isFixed = [](Object& o) {
        return cast<View>(&o) != nullptr && !cast<View>(&o)->changesSides();
      };
      stays = _accessibilityFindAncestor(object, isFixed, true) != nullptr;
    });
    return stays;
  }

  std::vector<ShownText> takeTexts() { return std::move(texts_); }

 private:
  void addText(Object& object) {
    for (const TextMember& member : textMembers) {
      if (!object.isKindOf(member.ofClass())) continue;
      const Ref<Object> text = object.safeValueForKey(member.key);
      const std::string shown = text ? text->description() : "";
      if (shown.empty()) continue;
      const Ref<String> spoken = questions_.ask(messages::accessibilityLabel, text);
      texts_.push_back({shown, spoken ? spoken->text() : shown, frameOf(object), object.isa().name(),
                        names_ ? names_(object) : ""});
      return;
    }
  }

  const ObjectNames& names_;
  HostQuestions questions_;
  std::vector<ShownText> texts_;
};

Ref<Object> viewOf(Receiver screen) {
  Object* const object = screen.get();
  if (object == nullptr || !object->isKindOf(ViewController::staticClass())) return Ref<Object>(object);
  return object->safeValueForKey("view"_key);
}

}  // namespace

ShownContent readShownContent(const Snapshot& snapshot, Receiver screen, const ObjectNames& names) {
  ContentReading reading(names);
  ShownContent content;
  const Ref<Object> view = viewOf(screen);
  if (!view) return content;
  content.area = reading.frameOf(view);
  const std::vector<Node>& nodes = snapshot.nodes();
  const bool isCovered = !nodes.empty() && nodes.front().states.modal;
  const Ref<Object> shown = isCovered ? snapshot.object(nodes.front().id) : view;
  if (shown) reading.readTexts(*shown, 0);
  for (const Node& node : nodes) {
    const Ref<Object> object = snapshot.object(node.id);
    if (reading.liesInScrollView(object)) content.scrollable.insert(node.id);
    if (reading.staysAround(object)) content.fromTheLeft.insert(node.id);
  }
  content.texts = reading.takeTexts();
  return content;
}

}  // namespace ax::reader
