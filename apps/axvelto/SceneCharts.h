#pragma once

#include <deque>
#include <unordered_set>
#include <utility>
#include <vector>

#include "apps/shared/ShownScene.h"

namespace ax::app {

// The charts of a scene, each once, with the snapshots that they stand in.
class SceneCharts {
 public:
  using Found = std::vector<std::pair<const reader::Snapshot*, const reader::Node*>>;

  // All of the scene: on the screen, and in what is made beside it; or only those in the object with an id.
  // Throws a Fault for an id that the scene does not have.
  SceneCharts(ShownScene& shown, const std::string& id);

  const Found& found() const { return found_; }

 private:
  void add(reader::Snapshot snapshot);

  std::deque<reader::Snapshot> snapshots_;
  Found found_;
  std::unordered_set<const Object*> known_;
};

}  // namespace ax::app
