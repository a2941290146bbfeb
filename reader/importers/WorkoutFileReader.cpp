#include "reader/importers/WorkoutFileReader.h"

#include <algorithm>
#include <iterator>

#include "reader/importers/FitFile.h"
#include "reader/importers/GpxFile.h"
#include "reader/importers/TcxFile.h"
#include "reader/importers/XmlFields.h"
#include "reader/importers/XmlText.h"

namespace ax::reader {
namespace {

struct FileKind {
  std::string_view root;
  std::vector<WorkoutActivity> (*read)(pugi::xml_node root);
  std::string_view home;      // where its activities stand
  std::string_view activity;  // what is expected there
  std::string_view point;     // and in each of those
};

constexpr FileKind kinds[] = {
    {"TrainingCenterDatabase", readTcx, "TrainingCenterDatabase/Activities", "Activity",
     "a Trackpoint with a Time"},
    {"gpx", readGpx, "gpx", "trk", "a trkpt with a time"},
};

bool tellsNothing(const WorkoutActivity& activity) {
  return activity.points.empty() && activity.laps.empty() && activity.duration == 0;
}

WorkoutFileResult readKind(const FileKind& kind, pugi::xml_node root) {
  WorkoutFile file{kind.read(root), std::nullopt};
  const std::string home(kind.home);
  const std::string activity(kind.activity);
  if (file.activities.empty()) {
    return WorkoutFileFault{"", home, "no workout", "at least one " + activity};
  }
  if (std::ranges::all_of(file.activities, [](const auto& each) { return each.points.empty(); })) {
    return WorkoutFileFault{"", home + '/' + activity, "no point with a time",
                            "at least " + std::string(kind.point)};
  }
  std::erase_if(file.activities, tellsNothing);
  return file;
}

WorkoutFileResult readDocument(const XmlText& xml, const WorkoutReadOptions& options) {
  auto fault = xml.fault();
  if (fault && (!options.readsDamaged || !xml.root())) return *std::move(fault);
  const std::string_view found = localName(xml.root());
  const auto kind = std::ranges::find(kinds, found, &FileKind::root);
  if (kind == std::end(kinds)) {
    return WorkoutFileFault{"", xml.placeOf(xml.root()), "the root element is " + std::string(found),
                            "TrainingCenterDatabase or gpx"};
  }
  WorkoutFileResult result = readKind(*kind, xml.root());
  if (auto* file = std::get_if<WorkoutFile>(&result)) file->damage = std::move(fault);
  return result;
}

WorkoutFileResult readFitFile(std::string_view bytes, const WorkoutReadOptions& options) {
  FitContent content = readFit(bytes);
  WorkoutFile file{std::move(content.activities), std::nullopt};
  if (content.fault) {
    file.damage = {"", "byte " + std::to_string(content.fault->at), content.fault->what,
                   content.fault->expected};
    if (!options.readsDamaged) return *std::move(file.damage);
  }
  std::erase_if(file.activities, tellsNothing);
  if (!file.activities.empty()) return file;
  if (file.damage) return *std::move(file.damage);
  return WorkoutFileFault{"", "byte 0", "a FIT file without a workout", "an activity with records"};
}

}  // namespace

WorkoutFileResult readWorkoutFile(std::string_view bytes, std::string_view name,
                                  const WorkoutReadOptions& options) {
  WorkoutFileResult result =
      isFit(bytes) ? readFitFile(bytes, options) : readDocument(XmlText(bytes), options);
  if (auto* fault = std::get_if<WorkoutFileFault>(&result)) fault->file = name;
  if (auto* file = std::get_if<WorkoutFile>(&result); file != nullptr && file->damage)
    file->damage->file = name;
  return result;
}

}  // namespace ax::reader
