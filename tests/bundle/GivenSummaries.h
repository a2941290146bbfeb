#pragma once

#include <cstdint>
#include <set>

#include "host/core/ActivitySummaryCache.h"

namespace ax {

// Days of activity in the host's one cache, for as long as this stands.
class GivenSummaries {
 public:
  GivenSummaries() = default;
  GivenSummaries(const GivenSummaries&) = delete;
  GivenSummaries& operator=(const GivenSummaries&) = delete;
  ~GivenSummaries() {
    for (const std::int64_t day : days_) take(day);
  }

  Ref<ActivitySummary> give(std::int64_t day, double move, double exercise, double stand) {
    const auto summary = make<ActivitySummary>();
    summary->setFractions(move, exercise, stand);
    host::ActivitySummaryCache::sharedInstance()->setSummaryForCacheIndex(summary, day);
    days_.insert(day);
    return summary;
  }
  static void take(std::int64_t day) {
    host::ActivitySummaryCache::sharedInstance()->setSummaryForCacheIndex(nullptr, day);
  }

 private:
  std::set<std::int64_t> days_;
};

}  // namespace ax
