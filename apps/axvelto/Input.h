#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "apps/axvelto/Command.h"
#include "reader/scene/Scene.h"

namespace ax::app {

// All bytes of a file, or of standard input for "-". Throws a Fault when it cannot be read.
std::string readInput(const std::string& file);

// Whether the bytes are a workout file: their first visible one opens an XML document.
bool isWorkoutFile(std::string_view bytes);

struct InputFile {
  std::string name;
  std::string bytes;
};

// The scene of one workout file, or of several as one. Throws a Fault.
nlohmann::ordered_json importWorkouts(const std::vector<InputFile>& files);

// The scene that the command line names, imported where it is a workout file, with its locale and the
// omissions checked. Throws a Fault.
reader::Scene sceneFor(const Arguments& arguments);

// The locale of the command line put into a scene's environment, if one was given. Throws a Fault for one
// that is not known.
void setLocale(reader::Scene& scene, const std::string& locale);
void checkOmissions(const std::vector<std::string>& names);

}  // namespace ax::app
