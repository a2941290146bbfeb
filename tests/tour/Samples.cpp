#include "tests/tour/Samples.h"

#include <algorithm>
#include <fstream>
#include <sstream>

namespace ax::tour {

std::filesystem::path samplesFolder() {
  return AXVELTO_SAMPLES;
}

std::vector<std::filesystem::path> sampleScenes() {
  std::vector<std::filesystem::path> scenes;
  for (const auto& entry : std::filesystem::directory_iterator(samplesFolder())) {
    if (entry.path().extension() == ".json") scenes.push_back(entry.path());
  }
  std::sort(scenes.begin(), scenes.end());
  return scenes;
}

std::string fileText(const std::filesystem::path& file) {
  std::ostringstream text;
  text << std::ifstream(file, std::ios::binary).rdbuf();
  return text.str();
}

std::string modulePath() {
  return (std::filesystem::read_symlink("/proc/self/exe").parent_path() / "../lib/AXVelto/AXVelto.so")
      .string();
}

Presented::Presented(const std::filesystem::path& file, const std::string& locale,
                     const std::vector<std::string>& without)
    : scene(std::make_unique<reader::Scene>(reader::readScene(fileText(file), file.filename().string()))) {
  if (!locale.empty()) scene->environment.locale = locale;
  run = std::make_unique<reader::SceneRun>(*scene, reader::SceneRunOptions{modulePath(), without});
  snapshot = reader::takeSnapshot(run->screen());
}

}  // namespace ax::tour
