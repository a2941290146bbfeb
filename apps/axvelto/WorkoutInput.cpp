#include "apps/axvelto/Input.h"
#include "reader/importers/WorkoutFileReader.h"

namespace ax::app {

using namespace reader;

namespace {

WorkoutFile readWorkout(const InputFile& file) {
  WorkoutFileResult result = readWorkoutFile(file.bytes, file.name);
  if (const auto* fault = std::get_if<WorkoutFileFault>(&result)) {
    throw Fault{fault->file, fault->place, fault->what, fault->expected};
  }
  return std::get<WorkoutFile>(std::move(result));
}

}  // namespace

nlohmann::ordered_json importWorkouts(const std::vector<InputFile>& files) {
  for (const InputFile& file : files) readWorkout(file);
  throw Fault{files.front().name, "", "workout files cannot be made into scenes yet", "a scene"};
}

}  // namespace ax::app
