#include "host/core/ActivitySummaryCache.h"

#include "platform/accessibility/BundleLoader.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

// How the app words a day's rings: as the accessibility bundle does, when one is loaded.
Ref<String> describeRings(ActivitySummary&, double move, double exercise, double stand, bool capped) {
  using Description = Ref<String> (*)(double, double, double, bool);
  const auto description =
      reinterpret_cast<Description>(LoadedBundle::exportedSymbol("accessibilityDescriptionForPercentages"));
  return description == nullptr ? nullptr : description(move, exercise, stand, capped);
}

Ref<Calendar> gregorianCalendarWithUTCTimeZone() {
  return make<Calendar>();
}

struct HostExtensions {
  HostExtensions() {
    ClassBuilder<ActivitySummary>(ActivitySummary::staticClass())
        .method<&describeRings>(
            "accessibilityDescriptionForPercentages:exercisingPercentage:standingPercentage:"
            "arePercentagesCapped:");
    ClassBuilder<Calendar>(Calendar::staticClass())
        .classMethod<&gregorianCalendarWithUTCTimeZone>("qs_gregorianCalendarWithUTCTimeZone");
  }
};

}  // namespace

Class& ActivitySummaryCache::staticClass() {
  using T = ActivitySummaryCache;
  static Class& result = ClassBuilder<T>("ActivitySummaryCache", Object::staticClass())
                             .classMethod<&T::sharedInstance>("sharedInstance")
                             .method<&T::activitySummaryForCacheIndex>("activitySummaryForCacheIndex:")
                             .method<&T::setSummaryForCacheIndex>("setSummary:forCacheIndex:")
                             .build();
  return result;
}

Ref<ActivitySummaryCache> ActivitySummaryCache::sharedInstance() {
  static const Ref<ActivitySummaryCache>& shared =
      *new Ref<ActivitySummaryCache>(make<ActivitySummaryCache>());
  return shared;
}

Ref<ActivitySummary> ActivitySummaryCache::activitySummaryForCacheIndex(std::int64_t index) {
  const auto found = summaries_.find(index);
  return found == summaries_.end() ? nullptr : found->second;
}

void ActivitySummaryCache::setSummaryForCacheIndex(Ref<ActivitySummary> summary, std::int64_t index) {
  summaries_[index] = std::move(summary);
}

static const RegisteredClass<ActivitySummaryCache> registered;
static const HostExtensions hostExtensions;

}  // namespace ax::host
