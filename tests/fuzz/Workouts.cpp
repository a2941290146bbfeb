#include <stdexcept>

#include "reader/importers/FileKind.h"
#include "reader/importers/Unpacking.h"
#include "reader/importers/WorkoutFileReader.h"
#include "reader/importers/WorkoutScene.h"
#include "reader/text/Fault.h"
#include "tests/fuzz/Pieces.h"

namespace {

using namespace ax::reader;

void read(std::string_view bytes, bool readsDamaged) {
  nameOfKind(bytes);
  const WorkoutFileResult result = readWorkoutFile(bytes, "input", {.readsDamaged = readsDamaged});
  const auto* file = std::get_if<WorkoutFile>(&result);
  if (file == nullptr) return;
  if (file->activities.empty()) throw std::logic_error("a file without a workout");
  for (const WorkoutActivity& activity : file->activities) workoutScene(activity);
  workoutListScene(file->activities);
}

}  // namespace

// Unpacked and read, strictly and as far as it goes, and made into screens.
void ax::fuzz::fuzzWorkouts(Bytes bytes) {
  const std::string text = textOf(bytes);
  for (const bool readsDamaged : {false, true}) {
    UnpackOptions options;
    options.readsDamaged = readsDamaged;
    options.onFault = [](const auto&...) {};
    try {
      unpack(text, "input", options,
             [&](const std::string&, std::string_view unpacked) { read(unpacked, readsDamaged); });
    } catch (const Fault& fault) {
      fault.text();
    }
  }
}
