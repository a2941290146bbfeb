#pragma once

#include <memory>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "platform/accessibility/BundleLoader.h"
#include "reader/scene/Scene.h"

namespace ax::reader {

class ObjectBuilder;

struct SceneRunOptions {
  std::string modulePath = {};            // the bundle to open and start; empty: none
  std::vector<std::string> without = {};  // more omissions, as a scene's "host.without" has them
};

// A scene that stands: its environment in force, the bundle started, its objects made and its screen
// presented. The run owns the objects. What the scene sets and takes away is the process's, and bundles
// start once, so a process carries one run (unit tests excepted). Main thread only.
class SceneRun {
 public:
  // Throws a Fault for what only shows while the objects are made. Keeps a reference to the scene.
  explicit SceneRun(const Scene& scene, const SceneRunOptions& options = {});
  ~SceneRun();

  const Scene& scene() const { return scene_; }
  // In the language of the scene; empty when it has none.
  const std::string& title() const { return title_; }
  // Nil when the scene has none. A view or a view controller.
  const Ref<Object>& screen() const { return screen_; }
  const std::vector<Ref<Object>>& objects() const { return objects_; }
  // The object that was given an id; nil for an unknown one.
  Ref<Object> objectWithId(const std::string& id) const;
  // Empty for an object without one.
  const std::string& idOf(const Object& object) const;
  // What the host raised while its days were kept and its screen was presented: "CHCell layoutSubviews: why".
  const std::vector<std::string>& hostFaults() const { return hostFaults_; }
  // Null without a module.
  const LoadedBundle* bundle() const { return bundle_.get(); }

  // Runs the scene's steps in order and answers the result document: "results", then the "notifications",
  // "assertions" and "contractFailures" of the whole run. What a step raises is its reply; a step that
  // cannot be carried out throws a Fault.
  nlohmann::ordered_json runSteps();
  // Of each step that has run; nothing for one without a reply.
  const std::vector<std::optional<nlohmann::ordered_json>>& replies() const { return replies_; }

 private:
  void openBundle(const std::string& modulePath);
  void makeObjects();

  const Scene& scene_;
  std::unique_ptr<LoadedBundle> bundle_;
  std::unique_ptr<ObjectBuilder> builder_;
  std::string title_;
  Ref<Object> screen_;
  std::vector<Ref<Object>> objects_;
  std::vector<std::string> hostFaults_;
  std::vector<std::optional<nlohmann::ordered_json>> replies_;
};

}  // namespace ax::reader
