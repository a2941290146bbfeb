#include "reader/importers/WorkoutFileReader.h"

#include <algorithm>
#include <iterator>

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
  return activity.points.empty() && activity.laps.empty();
}

WorkoutFileResult readKind(const FileKind& kind, pugi::xml_node root) {
  WorkoutFile file{kind.read(root)};
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

WorkoutFileResult readDocument(const XmlText& xml) {
  if (auto fault = xml.fault()) return *std::move(fault);
  const std::string_view found = localName(xml.root());
  const auto kind = std::ranges::find(kinds, found, &FileKind::root);
  if (kind != std::end(kinds)) return readKind(*kind, xml.root());
  return WorkoutFileFault{"", xml.placeOf(xml.root()), "the root element is " + std::string(found),
                          "TrainingCenterDatabase or gpx"};
}

}  // namespace

WorkoutFileResult readWorkoutFile(std::string_view bytes, std::string_view name) {
  const XmlText xml(bytes);
  WorkoutFileResult result = readDocument(xml);
  if (auto* fault = std::get_if<WorkoutFileFault>(&result)) fault->file = name;
  return result;
}

}  // namespace ax::reader
