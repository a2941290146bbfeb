#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/runtime/Class.h"
#include "reader/scene/JsonNode.h"

namespace ax::reader {

// The names that a scene gives while it is read: ids of objects and names of results. Every one is given
// once. Objects may refer to ids that come later; steps only to what stands before them.
class SceneIds {
 public:
  // `made` is the class of the object; null for a result, of which nothing is known yet.
  void declare(const JsonNode& name, const Class* made);
  void refer(const JsonNode& target);
  // After the objects and before the steps.
  void settleObjects();
  // The class of the object with that id; null when it is not known.
  const Class* classOf(const std::string& target) const;

 private:
  void check(const JsonNode& target) const;

  std::map<std::string, const Class*> classes_;
  std::vector<JsonNode> pending_;
  bool objectsStand_ = false;
};

}  // namespace ax::reader
