#include "apps/shared/ShownScene.h"

#include "apps/shared/Complaint.h"
#include "apps/shared/Input.h"
#include "platform/formatting/StringTable.h"
#include "platform/toolkit/TreeDepth.h"

namespace ax::app {

std::string modulePath() {
  static const char inThisProgram = 0;
  return formatting::resourceFolderBeside(&inThisProgram, "../lib/AXVelto") + "/AXVelto.so";
}

ShownScene::ShownScene(const Opening& opening)
    : scene_(std::make_unique<reader::Scene>(sceneFor(opening))),
      run_(std::make_unique<reader::SceneRun>(
          *scene_, reader::SceneRunOptions{.modulePath = modulePath(), .without = opening.without})) {
  for (const std::string& fault : run_->hostFaults()) {
    complain(scene_->file + ": the host raised, in " + fault);
  }
  tellOf(0);
}

reader::Snapshot ShownScene::snapshot() const {
  if (!run_->screen()) throw reader::Fault{scene_->file, "/screen", "no screen", "an object to present"};
  return snapshotOf(run_->screen());
}

reader::Snapshot ShownScene::snapshotOf(Receiver object) const {
  reader::Snapshot snapshot =
      reader::takeSnapshot(object, [this](const Object& named) { return run_->idOf(named); });
  tellOf(snapshot.timesRaised());
  return snapshot;
}

void ShownScene::tellOf(std::size_t timesRaised) const {
  const auto tell = [&](const std::string& what, std::size_t times) {
    if (times == 0) return;
    complain(scene_->file + ": " + what + ", " + std::to_string(times) + (times == 1 ? " time" : " times"));
  };
  tell("the host raised while it was asked", timesRaised);
  static std::size_t told = 0;
  tell("what lies deeper than " + std::to_string(deepestLevel) + " levels, or behind " +
           std::to_string(mostObjects) + " objects, was left out",
       timesTooDeep() - told);
  told = timesTooDeep();
}

}  // namespace ax::app
