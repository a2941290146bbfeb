#include "platform/runtime/MainThread.h"

#include <thread>

namespace ax {

static const std::thread::id mainThread = std::this_thread::get_id();

bool isMainThread() {
  return std::this_thread::get_id() == mainThread;
}

}  // namespace ax
