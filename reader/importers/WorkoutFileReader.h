#pragma once

#include <string_view>
#include <variant>

#include "reader/importers/WorkoutFile.h"

namespace ax::reader {

using WorkoutFileResult = std::variant<WorkoutFile, WorkoutFileFault>;

struct WorkoutReadOptions {
  bool readsDamaged = false;  // what stands before a damage is read, and the damage is told beside it
};

// Reads a FIT, TCX or GPX file that is already in memory; the first bytes and the root element decide which
// it is. `name` only goes into the fault. Texts are read in the encoding that they declare; every text in the
// result is UTF-8.
//
// Lenient about the parts: a value that is missing or not a finite number within its range is left out, a
// point without a time is left out, a time without an offset is in UTC. Strict about the whole: a file that
// is cut off, malformed or of another kind, whose checksum does not match, or without any point that has a
// time is a fault, and nothing is read.
WorkoutFileResult readWorkoutFile(std::string_view bytes, std::string_view name,
                                  const WorkoutReadOptions& options = {});

}  // namespace ax::reader
