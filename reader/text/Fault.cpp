#include "reader/text/Fault.h"

#include "reader/text/PlainText.h"

namespace ax::reader {

std::string Fault::text() const {
  std::string line = "axvelto: ";
  if (!file.empty()) line += shortened(file) + ": ";
  line += shortened(what);
  if (!place.empty()) line += ", at " + shortened(place);
  if (!expected.empty()) line += ", expected " + shortened(expected);
  return printable(line);
}

}  // namespace ax::reader
