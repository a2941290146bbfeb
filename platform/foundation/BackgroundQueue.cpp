#include "platform/foundation/BackgroundQueue.h"

#include <array>
#include <atomic>
#include <condition_variable>
#include <cstdio>
#include <deque>
#include <exception>
#include <mutex>
#include <thread>

#include "platform/runtime/Precondition.h"

namespace ax {

namespace {

std::atomic<std::size_t> failures = 0;
thread_local bool isOfTheQueue = false;

void countFailure(const char* what) {
  ++failures;
  std::fprintf(stderr, "a background task raised: %s\n", what);
}

void runGuarded(const std::function<void()>& task) {
  try {
    task();
  } catch (const std::exception& error) {
    countFailure(error.what());
  } catch (...) {
    countFailure("something that is no exception");
  }
}

class Queue {
 public:
  void add(std::function<void()> task) {
    const std::lock_guard lock(mutex_);
    tasks_.push_back(std::move(task));
    changed_.notify_one();
  }

  void waitUntilIdle() {
    std::unique_lock lock(mutex_);
    idle_.wait(lock, [this] { return tasks_.empty() && running_ == 0; });
  }

  ~Queue() {
    {
      const std::lock_guard lock(mutex_);
      ends_ = true;
    }
    changed_.notify_all();
    for (std::thread& worker : workers_) worker.join();
  }

 private:
  void work() {
    isOfTheQueue = true;
    std::unique_lock lock(mutex_);
    while (true) {
      changed_.wait(lock, [this] { return ends_ || !tasks_.empty(); });
      if (ends_) return;
      runFirst(lock);
      if (running_ == 0 && tasks_.empty()) idle_.notify_all();
    }
  }

  // The task ends before the lock is held again: what it captured may come back to the queue as it ends.
  void runFirst(std::unique_lock<std::mutex>& lock) {
    std::function<void()> task = std::move(tasks_.front());
    tasks_.pop_front();
    ++running_;
    lock.unlock();
    runGuarded(task);
    task = nullptr;
    lock.lock();
    --running_;
  }

  std::mutex mutex_;
  std::condition_variable changed_;
  std::condition_variable idle_;
  std::deque<std::function<void()>> tasks_;
  std::size_t running_ = 0;
  bool ends_ = false;
  std::array<std::thread, 2> workers_ = {std::thread([this] { work(); }), std::thread([this] { work(); })};
};

Queue& queue() {
  static Queue shared;
  return shared;
}

}  // namespace

void dispatchInBackground(std::function<void()> task) {
  queue().add(std::move(task));
}
void waitForBackgroundTasks() {
  precondition(!isOfTheQueue, "a task that waits for all tasks waits for itself: dispatch what is to follow");
  queue().waitUntilIdle();
}
std::size_t failedBackgroundTasks() {
  return failures;
}

}  // namespace ax
