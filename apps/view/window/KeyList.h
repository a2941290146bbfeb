#pragma once

#include <QDialog>
#include <QKeySequence>

#include "apps/view/window/Commands.h"

namespace ax::view {

QList<QKeySequence> keysOf(const Command& command);

// All keys with what they do. It deletes itself when it is closed.
class KeyList : public QDialog {
 public:
  explicit KeyList(QWidget* parent);
};

}  // namespace ax::view
