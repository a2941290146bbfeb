#include "apps/axvelto/Input.h"
#include "reader/importers/WorkoutFileReader.h"
#include "reader/importers/WorkoutScene.h"

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

nlohmann::ordered_json importWorkouts(const std::vector<InputFile>& files, const Arguments& arguments) {
  WorkoutSceneOptions options;
  if (!arguments.locale.empty()) options.locale = arguments.locale;
  if (!arguments.timeZone.empty()) options.timeZone = arguments.timeZone;
  std::vector<WorkoutFile> workouts;
  for (const InputFile& file : files) workouts.push_back(readWorkout(file));
  return workouts.size() == 1 ? workoutScene(workouts.front(), options) : workoutListScene(workouts, options);
}

}  // namespace ax::app
