#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "reader/scene/SceneStep.h"
#include "reader/text/Fault.h"

namespace ax::reader {

// A class or a member that the scene's host does without.
struct HostOmission {
  std::string place;  // empty when it was given on the command line
  std::string name;
};

// One day's rings, as fractions of the goals.
struct SceneDay {
  std::int64_t index;  // days since 1970-01-01
  double move = 0;
  double exercise = 0;
  double stand = 0;
};

// A screen as a file describes it. A plain record: nothing has been made or changed when it stands.
struct Scene {
  std::string file;                     // for faults
  SceneValue title = {};                // a text, literal or of the host's; nil when it has none
  std::vector<std::string> names = {};  // of people and places: texts that are the same in every language
  SceneEnvironment environment = {};
  std::vector<HostOmission> without = {};
  std::vector<SceneDay> days = {};
  std::optional<SceneObject> screen = {};
  std::vector<SceneObject> objects = {};
  std::vector<SceneStep> steps = {};
  std::vector<SceneTarget> moduleNames = {};          // targets and references that only the module can know
  std::optional<nlohmann::ordered_json> expect = {};  // of the whole: "speak", "notifications", ...
  bool isMirrored = false;  // the screen's frames are meant for a language of the other direction
};

// Reads a scene and checks it whole against the classes that are registered, hidden ones included: syntax,
// keys, kinds, dates, units, names of classes, members and methods, ids and references. A name that nothing
// has yet may be a class that the module brings: SceneRun says. `file` only goes into faults. Throws a Fault
// for the first thing that is wrong. Main thread only.
Scene readScene(std::string_view text, const std::string& file);
// The same of a document that has been read or made already.
Scene readSceneDocument(const nlohmann::ordered_json& document, const std::string& file);

// Checks a name as `--without` takes it: "Class" or "Class.member", where the class is the longest one that
// is registered. Throws a Fault for a name that the host does not have.
void checkOmission(const HostOmission& omission, const std::string& file);

}  // namespace ax::reader
