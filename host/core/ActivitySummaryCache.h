#pragma once

#include <map>

#include "platform/health/ActivitySummary.h"

namespace ax::host {

// The app's one store of the days' summaries, by day index.
class ActivitySummaryCache : public Object {
 public:
  static Class& staticClass();
  static Ref<ActivitySummaryCache> sharedInstance();

  // Nil for a day without activity.
  Ref<ActivitySummary> activitySummaryForCacheIndex(std::int64_t index);
  void setSummaryForCacheIndex(Ref<ActivitySummary> summary, std::int64_t index);

 private:
  std::map<std::int64_t, Ref<ActivitySummary>> summaries_;
};

}  // namespace ax::host
