#include "platform/foundation/BackgroundQueue.h"

#include <array>
#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>

namespace ax {

namespace {

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
    std::unique_lock lock(mutex_);
    while (true) {
      changed_.wait(lock, [this] { return ends_ || !tasks_.empty(); });
      if (ends_) return;
      const std::function<void()> task = std::move(tasks_.front());
      tasks_.pop_front();
      ++running_;
      lock.unlock();
      task();
      lock.lock();
      if (--running_ == 0 && tasks_.empty()) idle_.notify_all();
    }
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
  queue().waitUntilIdle();
}

}  // namespace ax
