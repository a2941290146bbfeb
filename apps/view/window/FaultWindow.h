#pragma once

#include <QMainWindow>

#include "reader/text/Fault.h"

namespace ax::view {

// Says why a file cannot be opened.
class FaultWindow : public QMainWindow {
 public:
  explicit FaultWindow(const reader::Fault& fault);
};

}  // namespace ax::view
