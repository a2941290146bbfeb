#include "reader/Fault.h"

namespace ax::reader {

std::string Fault::text() const {
  std::string line = "axvelto: ";
  if (!file.empty()) line += file + ": ";
  line += what;
  if (!place.empty()) line += ", at " + place;
  if (!expected.empty()) line += ", expected " + expected;
  return line;
}

}  // namespace ax::reader
