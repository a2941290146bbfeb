#include "reader/scene/SceneIds.h"

#include "reader/scene/HostNames.h"

namespace ax::reader {

Fault unknownTarget(const SceneTarget& target, const std::string& file) {
  return {file, target.place, "nothing is called \"" + target.text + "\"",
          "an id, an earlier result or a class"};
}

void SceneIds::declare(const JsonNode& name, const Class* made) {
  const std::string text = name.text();
  if (text.empty() || text.find('.') != std::string::npos) {
    name.fail("the name \"" + text + "\"", "a name that is not empty and holds no dot");
  }
  if (Class::namedEvenIfHidden(text) != nullptr) {
    name.fail("\"" + text + "\" is the name of a class", "a name of its own");
  }
  if (!classes_.emplace(text, made).second) {
    name.fail("\"" + text + "\" is taken", "a name that nothing before it has");
  }
}

void SceneIds::refer(const JsonNode& target) {
  target.text();
  if (objectsStand_) {
    check(target);
  } else {
    pending_.push_back(target);
  }
}

void SceneIds::settleObjects() {
  for (const JsonNode& target : pending_) check(target);
  pending_.clear();
  objectsStand_ = true;
}

void SceneIds::check(const JsonNode& target) {
  const std::string name = splitTarget(target.text()).first;
  if (classes_.contains(name) || Class::namedEvenIfHidden(name) != nullptr) return;
  unknown_.push_back({target.place(), target.text()});
}

const Class* SceneIds::classOf(const std::string& target) const {
  const auto found = classes_.find(target);
  return found == classes_.end() ? nullptr : found->second;
}

}  // namespace ax::reader
