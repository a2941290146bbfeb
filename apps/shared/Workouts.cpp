#include "apps/shared/Workouts.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

#include "apps/shared/Complaint.h"
#include "apps/shared/Input.h"
#include "reader/importers/FileKind.h"
#include "reader/importers/Unpacking.h"
#include "reader/importers/WorkoutFileReader.h"
#include "reader/importers/WorkoutScene.h"

namespace ax::app {

using reader::Fault;
using reader::FileKind;
using reader::WorkoutActivity;

namespace {

constexpr const char* formats = "a scene or a workout in FIT, TCX or GPX";
constexpr const char* workoutFormats = "a workout in FIT, TCX or GPX";

bool isWorkout(FileKind kind) {
  return kind == FileKind::fit || kind == FileKind::xml;
}

// Two devices, or two formats of one, differ by as much.
bool areSame(const WorkoutActivity& one, const WorkoutActivity& other) {
  constexpr double startsWithin = 2;
  constexpr double part = 0.01;
  const auto isNear = [](double a, double b) { return std::abs(a - b) <= part * std::max(a, b); };
  return one.sport == other.sport && std::abs(one.start - other.start) <= startsWithin &&
         (isNear(one.duration, other.duration) || isNear(one.activeSeconds, other.activeSeconds));
}

// How much of what a list shows it tells.
int toldBy(const WorkoutActivity& activity) {
  return (activity.measures.kilocalories ? 2 : 0) + (activity.metres > 0 ? 1 : 0);
}

reader::WorkoutSceneOptions optionsFor(const Opening& opening) {
  reader::WorkoutSceneOptions options;
  if (!opening.locale.empty()) options.locale = opening.locale;
  options.timeZone = opening.timeZone;
  return options;
}

}  // namespace

void Workouts::add(const std::string& name, std::string_view bytes) {
  if (!isWorkout(reader::kindOfFile(bytes))) {
    throw Fault{name, "", reader::nameOfKind(bytes), workoutFormats};
  }
  reader::WorkoutFileResult result =
      reader::readWorkoutFile(bytes, name, {.readsDamaged = opening_.readsDamaged});
  if (const auto* fault = std::get_if<reader::WorkoutFileFault>(&result)) {
    throw Fault{fault->file, fault->place, fault->what, fault->expected};
  }
  auto& file = std::get<reader::WorkoutFile>(result);
  if (file.damage)
    complain(Fault{name, file.damage->place, file.damage->what + ", read as far as it goes",
                   file.damage->expected});
  ++files_;
  for (WorkoutActivity& activity : file.activities) {
    if (!isKnown(name, activity)) keep(name, std::move(activity));
  }
}

void Workouts::keep(const std::string& file, WorkoutActivity activity) {
  const std::size_t number = kept_.size() + 1;
  if (opening_.workout != 0 ? number != opening_.workout : number > 1) reader::keepForList(activity);
  if (number == 2 && opening_.workout != 1) reader::keepForList(kept_.front().activity);
  kept_.push_back({file, files_, std::move(activity)});
}

bool Workouts::isKnown(const std::string& file, const WorkoutActivity& activity) {
  const auto same = std::ranges::find_if(
      kept_, [&](const Kept& each) { return each.number != files_ && areSame(each.activity, activity); });
  if (same == kept_.end()) return false;
  complain(file + ": the same workout as in " + same->file + ", counted once");
  if (toldBy(activity) > toldBy(same->activity)) {
    const bool isWhole = !same->activity.points.empty();
    same->activity = activity;
    if (!isWhole) reader::keepForList(same->activity);
  }
  return true;
}

nlohmann::ordered_json Workouts::scene() const {
  const reader::WorkoutSceneOptions options = optionsFor(opening_);
  if (opening_.workout > kept_.size()) {
    throw Fault{kept_.front().file, "--workout", "there is no workout " + std::to_string(opening_.workout),
                "1 to " + std::to_string(kept_.size())};
  }
  if (opening_.workout != 0) return workoutScene(kept_[opening_.workout - 1].activity, options);
  if (kept_.size() == 1) return workoutScene(kept_.front().activity, options);
  std::vector<WorkoutActivity> activities;
  for (const Kept& each : kept_) activities.push_back(each.activity);
  return workoutListScene(activities, options);
}

bool forEachUnpacked(const std::string& name, const Opening& opening,
                     const std::function<void(const std::string&, std::string_view)>& onFile) {
  bool isWhole = true;
  reader::UnpackOptions options;
  options.readsDamaged = opening.readsDamaged;
  options.onFault = [&](const std::string& file, const std::string& what, const std::string& expected) {
    isWhole = false;
    complain(Fault{file, "", what, expected});
  };
  const std::string bytes = readInput(name);
  reader::unpack(bytes, name, options, [&](const std::string& file, std::string_view unpacked) {
    if (file == name) return onFile(file, unpacked);
    try {
      onFile(file, unpacked);
    } catch (const Fault& fault) {
      isWhole = false;
      complain(fault);
    }
  });
  return isWhole;
}

reader::Scene readInputScene(const Opening& opening) {
  const std::string& file = opening.files.front();
  Workouts workouts(opening);
  std::optional<reader::Scene> scene;
  forEachUnpacked(file, opening, [&](const std::string& name, std::string_view bytes) {
    const FileKind kind = reader::kindOfFile(bytes);
    if (isWorkout(kind)) return workouts.add(name, bytes);
    if (kind != FileKind::json) throw Fault{name, "", reader::nameOfKind(bytes), formats};
    if (!scene) scene = reader::readScene(bytes, file);
  });
  if (!workouts.isEmpty()) return reader::readSceneDocument(workouts.scene(), file);
  if (!scene) throw Fault{file, "", "there is nothing in the archive that can be read", formats};
  return *std::move(scene);
}

}  // namespace ax::app
