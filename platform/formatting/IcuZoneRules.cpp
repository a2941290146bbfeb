#include <unicode/basictz.h>
#include <unicode/tztrans.h>

#include "platform/formatting/ZoneRules.h"

namespace ax::formatting {
namespace {

class IcuZoneRules final : public ZoneRules {
 public:
  explicit IcuZoneRules(std::unique_ptr<icu::BasicTimeZone> zone) : zone_(std::move(zone)) {}

  ZoneRange rangeAt(double time) const override;

 private:
  double offsetAt(double time, double* daylight) const;

  std::unique_ptr<icu::BasicTimeZone> zone_;
};

double IcuZoneRules::offsetAt(double time, double* daylight) const {
  int32_t raw = 0;
  int32_t saving = 0;
  UErrorCode status = U_ZERO_ERROR;
  zone_->getOffset(time * 1000.0, false, raw, saving, status);
  if (daylight != nullptr) *daylight = saving / 1000.0;
  return (raw + saving) / 1000.0;
}

ZoneRange IcuZoneRules::rangeAt(double time) const {
  ZoneRange range{-kEver, kEver, 0, 0, 0};
  range.offset = range.formerOffset = offsetAt(time, &range.daylight);
  icu::TimeZoneTransition change;
  if (zone_->getPreviousTransition(time * 1000.0, true, change)) {
    range.from = change.getTime() / 1000.0;
    range.formerOffset = offsetAt(range.from - 1, nullptr);
  }
  if (zone_->getNextTransition(time * 1000.0, false, change)) range.to = change.getTime() / 1000.0;
  return range;
}

}  // namespace

std::unique_ptr<ZoneRules> icuZoneRules(const std::string& name) {
  std::unique_ptr<icu::TimeZone> zone(icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(name)));
  const auto* known = dynamic_cast<const icu::BasicTimeZone*>(zone.get());
  if (known == nullptr || *known == icu::TimeZone::getUnknown()) return nullptr;
  return std::make_unique<IcuZoneRules>(std::unique_ptr<icu::BasicTimeZone>(known->clone()));
}

std::unique_ptr<ZoneRules> zoneRules(const std::string& name) {
  std::unique_ptr<ZoneRules> rules = systemZoneRules(name);
  return rules ? std::move(rules) : icuZoneRules(name);
}

}  // namespace ax::formatting
