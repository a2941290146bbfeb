#include "platform/formatting/ZoneRanges.h"

#include <unicode/basictz.h>
#include <unicode/tztrans.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>

#include "platform/formatting/Region.h"

namespace ax::formatting {
namespace {

constexpr double kEver = std::numeric_limits<double>::infinity();

// Readings come in runs, so a few stretches serve them; the oldest makes room.
struct ZoneClock {
  std::uint64_t generation = 0;
  std::unique_ptr<icu::TimeZone> zone;
  const icu::BasicTimeZone* rules = nullptr;  // `zone`, when its changes can be told
  std::array<ZoneRange, 32> ranges;
  std::size_t held = 0;
  std::size_t next = 0;
  std::size_t last = 0;
};

ZoneClock& zoneClock() {
  static ZoneClock* const clock = new ZoneClock;
  if (clock->generation == regionGeneration()) return *clock;
  clock->zone.reset(icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(currentRegion().timeZone)));
  clock->rules = dynamic_cast<const icu::BasicTimeZone*>(clock->zone.get());
  clock->held = clock->next = clock->last = 0;
  clock->generation = regionGeneration();
  return *clock;
}

double offsetAt(const icu::TimeZone& zone, double time, double* daylight) {
  int32_t raw = 0;
  int32_t saving = 0;
  UErrorCode status = U_ZERO_ERROR;
  zone.getOffset(time * 1000.0, false, raw, saving, status);
  if (daylight != nullptr) *daylight = saving / 1000.0;
  return (raw + saving) / 1000.0;
}

ZoneRange measure(const ZoneClock& clock, double time) {
  ZoneRange range{-kEver, kEver, 0, 0, 0};
  range.offset = range.formerOffset = offsetAt(*clock.zone, time, &range.daylight);
  if (clock.rules == nullptr) {
    range.from = time;
    range.to = std::nextafter(time, kEver);
    return range;
  }
  icu::TimeZoneTransition change;
  if (clock.rules->getPreviousTransition(time * 1000.0, true, change)) {
    range.from = change.getTime() / 1000.0;
    range.formerOffset = offsetAt(*clock.zone, range.from - 1, nullptr);
  }
  if (clock.rules->getNextTransition(time * 1000.0, false, change)) range.to = change.getTime() / 1000.0;
  return range;
}

}  // namespace

const ZoneRange& zoneRangeAt(double time) {
  ZoneClock& clock = zoneClock();
  const auto holds = [time](const ZoneRange& range) { return range.from <= time && time < range.to; };
  if (clock.held > 0 && holds(clock.ranges[clock.last])) return clock.ranges[clock.last];
  for (std::size_t i = 0; i < clock.held; ++i) {
    if (holds(clock.ranges[i])) return clock.ranges[clock.last = i];
  }
  clock.last = clock.next;
  clock.next = (clock.next + 1) % clock.ranges.size();
  clock.held = std::max(clock.held, clock.last + 1);
  return clock.ranges[clock.last] = measure(clock, time);
}

double instantOfLocal(double local, RepeatedTime which) {
  const ZoneClock& clock = zoneClock();
  if (clock.rules == nullptr) return local - offsetAt(*clock.zone, local, nullptr);
  const auto repeated = which == RepeatedTime::first ? UCAL_TZ_LOCAL_FORMER : UCAL_TZ_LOCAL_LATTER;
  int32_t raw = 0;
  int32_t saving = 0;
  UErrorCode status = U_ZERO_ERROR;
  clock.rules->getOffsetFromLocal(local * 1000.0, UCAL_TZ_LOCAL_FORMER, repeated, raw, saving, status);
  return local - (raw + saving) / 1000.0;
}

}  // namespace ax::formatting
