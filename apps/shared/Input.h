#pragma once

#include <string>
#include <vector>

#include "apps/shared/Opening.h"
#include "reader/scene/Scene.h"

namespace ax::app {

// All bytes of a file, or of standard input for "-", each time the same. Throws a Fault that tells a missing
// file, a folder and a file without permission apart.
std::string readInput(const std::string& file);

// The scene that the command line names, imported where it is a workout file, with its locale, its time zone
// and the omissions checked. Throws a Fault.
reader::Scene sceneFor(const Opening& opening);

// Throw a Fault for a locale or time zone that is not known, and for a class or member that the host does not
// have.
void checkLocale(const std::string& locale);
void checkTimeZone(const std::string& timeZone);
void checkOmissions(const std::vector<std::string>& names);

}  // namespace ax::app
