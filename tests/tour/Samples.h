#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "reader/scene/SceneRun.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::tour {

std::filesystem::path samplesFolder();
// The sample scenes, sorted by name.
std::vector<std::filesystem::path> sampleScenes();
std::string fileText(const std::filesystem::path& file);
// The module as the build lays it out beside the tests.
std::string modulePath();

// One sample on the screen, in a locale of the caller's choice; in its own when that is empty.
struct Presented {
  Presented(const std::filesystem::path& file, const std::string& locale,
            const std::vector<std::string>& without = {});
  std::unique_ptr<reader::Scene> scene;
  std::unique_ptr<reader::SceneRun> run;
  reader::Snapshot snapshot;
};

}  // namespace ax::tour
