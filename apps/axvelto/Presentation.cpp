#include "apps/axvelto/Presentation.h"

#include <iostream>

#include "apps/axvelto/Input.h"
#include "platform/formatting/StringTable.h"

namespace ax::app {

std::string modulePath() {
  static const char inThisProgram = 0;
  return formatting::resourceFolderBeside(&inThisProgram, "../lib/AXVelto") + "/AXVelto.so";
}

Presentation::Presentation(const Arguments& arguments)
    : scene_(std::make_unique<reader::Scene>(sceneFor(arguments))),
      run_(std::make_unique<reader::SceneRun>(
          *scene_, reader::SceneRunOptions{.modulePath = modulePath(), .without = arguments.without})) {
  for (const std::string& fault : run_->hostFaults()) {
    std::cerr << "axvelto: " << scene_->file << ": the host raised, in " << fault << '\n';
  }
}

reader::Snapshot Presentation::snapshot() const {
  if (!run_->screen()) throw reader::Fault{scene_->file, "/screen", "no screen", "an object to present"};
  return snapshotOf(run_->screen());
}

reader::Snapshot Presentation::snapshotOf(Receiver object) const {
  reader::Snapshot snapshot =
      reader::takeSnapshot(object, [this](const Object& named) { return run_->idOf(named); });
  if (const std::size_t times = snapshot.timesRaised(); times != 0) {
    std::cerr << "axvelto: " << scene_->file << ": the host raised while it was asked, " << times
              << (times == 1 ? " time\n" : " times\n");
  }
  return snapshot;
}

}  // namespace ax::app
