#include "apps/shared/Complaint.h"

#include <iostream>

#include "reader/text/PlainText.h"

namespace ax::app {

void complain(const std::string& message) {
  std::cerr << "axvelto: " << reader::printable(reader::shortened(message)) << '\n';
}

void complain(const reader::Fault& fault) {
  std::cerr << fault.text() << '\n';
}

}  // namespace ax::app
