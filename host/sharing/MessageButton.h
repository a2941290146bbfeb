#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// Puts a button that sends the controller "_sendMessageButtonTapped:" into the navigation bar, unless the
// controller has right items already.
void addMessageButton(ViewController& controller);

}  // namespace ax::host
