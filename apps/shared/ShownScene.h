#pragma once

#include <memory>
#include <string>

#include "apps/shared/Opening.h"
#include "reader/scene/SceneRun.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::app {

// The bundle's module as it is installed beside this program.
std::string modulePath();

// A scene that stands with the bundle in it, and its screen. A process makes one.
class ShownScene {
 public:
  // Throws a Fault. What the host raised meanwhile goes to standard error.
  explicit ShownScene(const Opening& opening);

  const reader::Scene& scene() const { return *scene_; }
  reader::SceneRun& run() { return *run_; }
  // The screen at this moment; throws a Fault for a scene without one.
  reader::Snapshot snapshot() const;
  // The same of any object.
  reader::Snapshot snapshotOf(Receiver object) const;
  // To standard error, where there is something to tell: how often the host raised while it was asked, and
  // what was left out since the last time.
  void tellOf(std::size_t timesRaised) const;

 private:
  std::unique_ptr<reader::Scene> scene_;
  std::unique_ptr<reader::SceneRun> run_;
};

}  // namespace ax::app
