#pragma once

namespace ax {

// Whether the user is known to use a wheelchair. While the screen reader runs, the first call in the process
// asks the health store and waits; every later one answers at once with what is known and has the store
// asked again in the background. Without the screen reader nothing is asked. To be called on the main
// thread; the store answers on another.
bool _userIsWheelchairUserWithParloOn();

}  // namespace ax
