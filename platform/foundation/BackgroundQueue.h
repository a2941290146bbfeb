#pragma once

#include <functional>

namespace ax {

// Runs a task on the shared background queue of default priority: soon, in no particular order, perhaps
// beside others. The task must not touch objects of the main thread. May be called on any thread.
void dispatchInBackground(std::function<void()> task);

// Returns when every task that was dispatched before has ended.
void waitForBackgroundTasks();

}  // namespace ax
