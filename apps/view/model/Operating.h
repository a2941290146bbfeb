#pragma once

#include <string>

#include "apps/view/model/ScreenModel.h"

// Acting on the live objects of a screen. What the host raises counts as nothing and is told. Main thread
// only.
namespace ax::view {

// What followed from acting, with the screen asked anew.
struct Effect {
  reader::ActionResult result = reader::ActionResult::unavailable;
  ScreenChange change = {};
  std::vector<std::string> announcements = {};  // in order; what the host posted, and what went wrong
};

Effect operate(ScreenModel& model, reader::Action action, ItemId item);

// Takes away the modal view around the item: its own way where it, or what it lies in, knows how to be
// escaped from, else it is hidden. Without one, nothing is available.
Effect dismissModal(ScreenModel& model, ItemId item);

}  // namespace ax::view
