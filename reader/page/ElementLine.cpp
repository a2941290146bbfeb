#include "reader/page/ElementLine.h"

#include "reader/speech/SpokenTime.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

std::optional<std::string> attributeOf(bool isSet, const char* value) {
  return isSet ? std::optional<std::string>(value) : std::nullopt;
}

bool isLink(const Node& node) {
  return (node.traits & TraitLink) != 0;
}

bool isButton(const Node& node) {
  return (node.traits & TraitButton) != 0 && !isLink(node);
}

std::optional<std::string> expansionOf(const Node& node) {
  if (node.states.expanded) return "true";
  return attributeOf(node.states.collapsed, "false");
}

// The element for one role, around its name.
class LineWriter {
 public:
  LineWriter(Markup& html, const Node& node, const std::string& id, int headingLevel)
      : html_(html),
        node_(node),
        id_(id),
        heading_(std::to_string(headingLevel).insert(0, 1, 'h')),
        hint_(attributeOf(!withSpokenTimes(node.hint).empty(), "")) {
    if (hint_) hint_ = id + "-hint";
  }

  void write() {
    addRoleWord();
    addNamed();
    const std::string value = withSpokenTimes(node_.value);
    const bool isTold = node_.role == Role::adjustable;  // by the slider
    if (!value.empty()) {
      html_.element("span", {{"class", "value"}, {"aria-hidden", attributeOf(isTold, "true")}}, value);
    }
    addStateWords(html_, node_);
    if (hint_) html_.element("span", {{"class", "hint"}, {"id", hint_}}, withSpokenTimes(node_.hint));
  }

 private:
  // For the eye: the element itself tells it to a listener.
  void addRoleWord() {
    struct Word {
      Role role;
      const char* key;
    };
    constexpr Word words[] = {{Role::header, "role.header"},
                              {Role::button, "role.button"},
                              {Role::link, "role.link"},
                              {Role::image, "role.image"},
                              {Role::adjustable, "role.adjustable"}};
    for (const Word& word : words) {
      if (word.role != node_.role) continue;
      html_.element("span", {{"class", "role"}, {"aria-hidden", "true"}}, readerText(word.key));
    }
  }

  void addNamed() {
    switch (node_.role) {
      case Role::header:
        return addHeading();
      case Role::button:
      case Role::link:
        return addControl(hint_);
      case Role::adjustable:
        return addSlider();
      case Role::image:
        html_.element(
            "span",
            {{"class", "name"}, {"role", "img"}, {"aria-label", nameOf(node_)}, {"aria-describedby", hint_}},
            nameOf(node_));
        return;
      default:
        html_.element("p", {{"class", "name"}, {"aria-describedby", hint_}}, nameOf(node_));
    }
  }

  void addHeading() {
    const bool isControl = isButton(node_) || isLink(node_);
    html_.open(heading_, {{"class", "name"}, {"aria-describedby", isControl ? std::nullopt : hint_}});
    if (isControl) {
      addControl(hint_);
    } else {
      html_.text(nameOf(node_));
    }
    html_.close();
  }

  void addControl(const std::optional<std::string>& description) {
    const States& states = node_.states;
    if (isLink(node_)) {
      html_.element("a",
                    {{"class", "name"},
                     {"href", "#" + id_},
                     {"aria-disabled", attributeOf(states.disabled, "true")},
                     {"aria-current", attributeOf(states.selected, "true")},
                     {"aria-expanded", expansionOf(node_)},
                     {"aria-describedby", description}},
                    nameOf(node_));
      return;
    }
    html_.element("button",
                  {{"class", "name"},
                   {"type", "button"},
                   {"disabled", states.disabled},
                   {"aria-current", attributeOf(states.selected, "true")},
                   {"aria-expanded", expansionOf(node_)},
                   {"aria-describedby", description}},
                  nameOf(node_));
  }

  // It has one place alone, since a page cannot move what the screen shows.
  void addSlider() {
    html_.element("label", {{"class", "name"}, {"for", id_ + "-slider"}}, nameOf(node_));
    html_.empty("input", {{"type", "range"},
                          {"id", id_ + "-slider"},
                          {"min", "0"},
                          {"max", "0"},
                          {"value", "0"},
                          {"disabled", node_.states.disabled},
                          {"aria-valuetext", withSpokenTimes(node_.value)},
                          {"aria-describedby", hint_}});
  }

  Markup& html_;
  const Node& node_;
  const std::string& id_;
  std::string heading_;
  std::optional<std::string> hint_;  // the id of its text
};

}  // namespace

std::string nameOf(const Node& node) {
  const std::string label = withSpokenTimes(node.label);
  return label.empty() && node.series ? withSpokenTimes(node.series->name) : label;
}

void addStateWords(Markup& html, const Node& node) {
  const bool isTold = isButton(node) || isLink(node);
  const States& states = node.states;
  const std::pair<bool, const char*> words[] = {{states.selected, "state.selected"},
                                                {states.disabled, "state.disabled"},
                                                {states.expanded, "state.expanded"},
                                                {states.collapsed, "state.collapsed"}};
  for (const auto& [holds, key] : words) {
    if (!holds) continue;
    html.element("span", {{"class", "state"}, {"aria-hidden", attributeOf(isTold, "true")}}, readerText(key));
  }
  if (states.modal) html.element("span", {{"class", "state"}}, readerText("state.modal"));
}

void addElementLine(Markup& html, const Node& node, const std::string& id, int headingLevel) {
  LineWriter(html, node, id, headingLevel).write();
}

}  // namespace ax::reader
