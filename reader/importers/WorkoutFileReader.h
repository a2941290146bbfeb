#pragma once

#include <string>
#include <string_view>
#include <variant>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

// Why a file cannot be read, in parts that make one line: "FILE: what, at place, expected ...".
struct WorkoutFileFault {
  std::string file;   // the name that the caller gave
  std::string place;  // "line 12, column 5" (columns count characters), or a path of elements
  std::string what;
  std::string expected;
};

using WorkoutFileResult = std::variant<WorkoutFile, WorkoutFileFault>;

// Reads a TCX or GPX file that is already in memory; the root element decides which it is. `name` only
// goes into the fault. UTF-8, UTF-16 and Latin-1 are understood; every text in the result is UTF-8.
//
// Lenient about the parts: a value that is missing or not a finite number within its range is left out, a
// point without a time is left out, a time without an offset is in UTC. Strict about the whole: XML that is
// cut off or malformed, another root element, or no point with a time at all is a fault, and nothing is read.
WorkoutFileResult readWorkoutFile(std::string_view bytes, std::string_view name);

}  // namespace ax::reader
