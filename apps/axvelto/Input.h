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

// The scene of one workout file in detail, or of several as a list, for the locale and the time zone that the
// command line names. Throws a Fault.
nlohmann::ordered_json importWorkouts(const std::vector<InputFile>& files, const Arguments& arguments);

// The scene that the command line names, imported where it is a workout file, with its locale and the
// omissions checked. Throws a Fault.
reader::Scene sceneFor(const Arguments& arguments);

// Throw a Fault for a locale or time zone that is not known, and for a class or member that the host does not
// have.
void checkLocale(const std::string& locale);
void checkTimeZone(const std::string& timeZone);
void checkOmissions(const std::vector<std::string>& names);

}  // namespace ax::app
