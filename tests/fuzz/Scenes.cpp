#include "host/core/HostApp.h"
#include "reader/scene/SceneRun.h"
#include "reader/snapshot/Snapshot.h"
#include "reader/transcript/Transcript.h"
#include "tests/fuzz/Pieces.h"
#include "tests/tour/Samples.h"

// Loaded, presented with the bundle, walked, and its own steps asked.
void ax::fuzz::fuzzScenes(Bytes bytes) {
  host::linkHost();
  static const std::string module = tour::modulePath();
  try {
    const reader::Scene scene = reader::readScene(textOf(bytes), "input");
    reader::SceneRun run(scene, {.modulePath = module});
    if (run.screen()) {
      const reader::Snapshot snapshot = reader::takeSnapshot(run.screen());
      reader::transcript(snapshot, run.title());
      for (const reader::Node& node : snapshot.nodes()) snapshot.hitTest({node.frame.x, node.frame.y});
    }
    run.runSteps();
  } catch (const reader::Fault& fault) {
    fault.text();
  }
}
