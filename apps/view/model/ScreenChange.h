#pragma once

#include <vector>

#include "apps/view/model/Item.h"

namespace ax::view {

// What one asking anew found different of an item that stayed.
struct ItemChange {
  ItemId item = 0;
  bool name = false;
  bool hint = false;
  bool position = false;
  bool frame = false;
  bool selected = false;
  bool disabled = false;
  bool expansion = false;

  bool isAny() const { return name || hint || position || frame || selected || disabled || expansion; }
};

struct ScreenChange {
  std::vector<ItemId> added;  // parents before their children
  std::vector<ItemChange> changed;
  bool isElsewhere = false;  // the focus could not stay on its object

  bool isAny() const { return !added.empty() || !changed.empty() || isElsewhere; }
};

// Learns what happens to a screen while it is asked anew.
class ScreenListener {
 public:
  virtual ~ScreenListener() = default;
  // Items that are still there and will not be at the next call, children before their parents.
  virtual void itemsAboutToGo(const std::vector<ItemId>& items) = 0;
};

}  // namespace ax::view
