#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/runtime/Class.h"
#include "reader/scene/JsonNode.h"
#include "reader/text/Fault.h"

namespace ax::reader {

// Something named by an id, an earlier result, a class, or an item of one of these ("bars.0").
struct SceneTarget {
  std::string place;
  std::string text;
};

// What is wrong with a target that nothing answers to.
Fault unknownTarget(const SceneTarget& target, const std::string& file);

// The names that a scene gives while it is read: ids of objects and names of results. Every one is given
// once. Objects may refer to ids that come later; steps only to what stands before them.
class SceneIds {
 public:
  // `made` is the class of the object; null for a result, of which nothing is known yet.
  void declare(const JsonNode& name, const Class* made);
  void refer(const JsonNode& target);
  // After the objects and before the steps.
  void settleObjects();
  // What has been named so far and is neither an id, an earlier result nor a registered class.
  const std::vector<SceneTarget>& unknown() const { return unknown_; }
  // The class of the object with that id; null when it is not known.
  const Class* classOf(const std::string& target) const;

 private:
  void check(const JsonNode& target);

  std::map<std::string, const Class*> classes_;
  std::vector<JsonNode> pending_;
  std::vector<SceneTarget> unknown_;
  bool objectsStand_ = false;
};

}  // namespace ax::reader
