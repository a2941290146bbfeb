#include "bundle/shared/WheelchairUse.h"

#include <atomic>
#include <mutex>

#include "platform/foundation/BackgroundQueue.h"
#include "platform/foundation/Environment.h"
#include "platform/health/HealthStore.h"

namespace ax {

namespace {

std::atomic<bool> isWheelchairUser = false;

void askHealthStore() {
  Ref<Object> error;
  const Ref<WheelchairUseObject> answer = make<HealthStore>()->wheelchairUseWithError(error);
  if (!error) isWheelchairUser = answer && WheelchairUse(answer->wheelchairUse()) == WheelchairUse::yes;
}

}  // namespace

bool _userIsWheelchairUserWithParloOn() {
  if (!isScreenReaderRunning()) return isWheelchairUser;
  static std::once_flag firstQuery;
  bool isFirst = false;
  std::call_once(firstQuery, [&] {
    isFirst = true;
    askHealthStore();
  });
  const bool known = isWheelchairUser;  // what is asked now serves later calls
  if (!isFirst) dispatchInBackground(askHealthStore);
  return known;
}

}  // namespace ax
