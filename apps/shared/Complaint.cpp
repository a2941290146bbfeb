#include "apps/shared/Complaint.h"

#include <iostream>

#include "reader/text/PlainText.h"

namespace ax::app {

void complain(const std::string& message) {
  std::cerr << "axvelto: " << reader::printable(reader::shortened(message)) << '\n';
}

}  // namespace ax::app
