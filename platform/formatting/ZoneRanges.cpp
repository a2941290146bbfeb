#include "platform/formatting/ZoneRanges.h"

#include <cstdint>
#include <string>

#include "platform/base/NeverDestroyed.h"
#include "platform/formatting/Region.h"

namespace ax::formatting {
namespace {

struct CurrentRanges {
  std::uint64_t generation = 0;
  std::string zone;
  std::shared_ptr<ZoneRanges> ranges;
};

constexpr double kDay = 86400;

}  // namespace

// The oldest makes room.
const ZoneRange& ZoneRanges::look(double time) {
  for (std::size_t i = 0; i < ranges_.size(); ++i) {
    if (ranges_[i].from <= time && time < ranges_[i].to) return ranges_[last_ = i];
  }
  last_ = next_;
  next_ = (next_ + 1) % ranges_.size();
  return ranges_[last_] = rules_->rangeAt(time);
}

double ZoneRanges::instantOfLocal(double local, RepeatedTime which) {
  for (ZoneRange range = at(local - kDay);; range = at(range.to)) {
    const double instant = local - range.offset;
    if (instant < range.from) return local - range.formerOffset;
    if (instant >= range.to) continue;
    const double again = local - at(range.to == kEver ? instant : range.to).offset;
    return which == RepeatedTime::last && again >= range.to ? again : instant;
  }
}

const std::shared_ptr<ZoneRanges>& currentZoneRanges() {
  static NeverDestroyed<CurrentRanges> current;
  if (current->generation == regionGeneration()) return current->ranges;
  current->generation = regionGeneration();
  if (current->ranges && current->zone == currentRegion().timeZone) return current->ranges;
  current->zone = currentRegion().timeZone;
  current->ranges = std::make_shared<ZoneRanges>(zoneRules(current->zone));
  return current->ranges;
}

}  // namespace ax::formatting
