#pragma once

#include <cstddef>
#include <functional>

namespace ax {

// Runs a task on the shared background queue of default priority: soon, in no particular order, perhaps
// beside others. The task must not touch objects of the main thread. What it captured ends on the queue's
// thread as soon as it has run, and may dispatch further tasks. What it raises is counted and told on
// standard error. May be called on any thread.
void dispatchInBackground(std::function<void()> task);

// Returns when every task that was dispatched before has ended, and what it captured too. Not to be called by
// a task, which would wait for itself.
void waitForBackgroundTasks();

// How many tasks have raised something in this process. Any thread.
std::size_t failedBackgroundTasks();

}  // namespace ax
