#pragma once

#include <QLabel>

namespace ax::view {

// A line for what happened, which a screen reader speaks as it appears.
class Notice : public QLabel {
 public:
  Notice();

  void announce(const QString& text);
  void clearAway();
};

}  // namespace ax::view
