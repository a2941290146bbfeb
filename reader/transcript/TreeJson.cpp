#include "reader/transcript/TreeJson.h"

#include "reader/speech/SpokenTime.h"
#include "reader/text/TextJson.h"
#include "reader/text/TraitNames.h"

namespace ax::reader {

using Json = nlohmann::ordered_json;

namespace {

Json stateNames(const States& states) {
  Json names = Json::array();
  if (states.selected) names.push_back("selected");
  if (states.disabled) names.push_back("disabled");
  if (states.expanded) names.push_back("expanded");
  if (states.collapsed) names.push_back("collapsed");
  if (states.modal) names.push_back("modal");
  return names;
}

Json actionNames(const Actions& actions) {
  Json names = Json::array();
  for (const Action action : {Action::activate, Action::increment, Action::decrement}) {
    if (actions.has(action)) names.push_back(actionName(action));
  }
  return names;
}

void addUnlessEmpty(Json& object, const char* key, Json value) {
  if (!value.empty()) object[key] = std::move(value);
}

// With what is spoken instead where that differs.
Json spokenTextAsJson(const std::optional<AttributedText>& text) {
  Json json = textAsJson(text);
  const std::string spoken = withSpokenTimes(text);
  if (text && spoken != text->text) json["spoken"] = spoken;
  return json;
}

Json nodesAsJson(const Snapshot& snapshot, const std::vector<NodeId>& ids);

Json nodeAsJson(const Snapshot& snapshot, const Node& node) {
  Json json = {{"class", node.className}, {"id", node.objectId.empty() ? Json() : Json(node.objectId)}};
  json["role"] = roleName(node.role);
  json["isElement"] = node.isElement;
  json["label"] = spokenTextAsJson(node.label);
  json["value"] = spokenTextAsJson(node.value);
  json["hint"] = spokenTextAsJson(node.hint);
  json["traits"] = traitNames(node.traits);
  addUnlessEmpty(json, "states", stateNames(node.states));
  addUnlessEmpty(json, "actions", actionNames(node.actions));
  json["frame"] = rectAsJson(node.frame);
  addUnlessEmpty(json, "children", nodesAsJson(snapshot, node.children));
  return json;
}

Json nodesAsJson(const Snapshot& snapshot, const std::vector<NodeId>& ids) {
  Json nodes = Json::array();
  for (const NodeId id : ids) nodes.push_back(nodeAsJson(snapshot, *snapshot.node(id)));
  return nodes;
}

}  // namespace

Json treeAsJson(const Snapshot& snapshot) {
  return nodesAsJson(snapshot, snapshot.topNodes());
}

}  // namespace ax::reader
