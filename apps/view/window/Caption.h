#pragma once

#include <QLabel>

namespace ax::view {

// The spoken line of the focused element in large type, for those who read along. Assistive technology has
// the element itself and does not meet it.
class Caption : public QLabel {
 public:
  Caption();

  void show(const QString& line);
};

}  // namespace ax::view
