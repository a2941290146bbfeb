#include "platform/formatting/FormatterZone.h"

#include <unicode/timezone.h>

#include <chrono>
#include <memory>

#include "platform/formatting/Region.h"
#include "platform/formatting/ZoneRanges.h"

namespace ax::formatting {
namespace {

constexpr double kMillisecond = 1000;

int32_t millisecondsOf(double seconds) {
  return static_cast<int32_t>(seconds * kMillisecond);
}

double secondsNow() {
  return std::chrono::duration<double>(std::chrono::system_clock::now().time_since_epoch()).count();
}

class FormatterZone final : public icu::TimeZone {
 public:
  FormatterZone(const icu::UnicodeString& name, std::shared_ptr<ZoneRanges> ranges)
      : icu::TimeZone(name), ranges_(std::move(ranges)) {}
  FormatterZone(const FormatterZone&) = default;
  FormatterZone& operator=(const FormatterZone&) = delete;

  void getOffset(UDate date, UBool local, int32_t& raw, int32_t& saving, UErrorCode& status) const override;
  int32_t getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t weekday,
                    int32_t milliseconds, UErrorCode& status) const override;
  int32_t getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t weekday,
                    int32_t milliseconds, int32_t monthLength, UErrorCode& status) const override;
  int32_t getRawOffset() const override;
  UBool useDaylightTime() const override;
  UBool inDaylightTime(UDate date, UErrorCode& status) const override;
  UBool hasSameRules(const icu::TimeZone& other) const override;
  FormatterZone* clone() const override { return new FormatterZone(*this); }
  UClassID getDynamicClassID() const override;
  void setRawOffset(int32_t) override {}  // its rules are not to be changed

 private:
  std::shared_ptr<ZoneRanges> ranges_;
};

// Of a local time that comes twice the later is meant, and one that never comes is counted on from before,
// as a calendar takes them that is asked for nothing else.
void FormatterZone::getOffset(UDate date, UBool local, int32_t& raw, int32_t& saving, UErrorCode&) const {
  double time = date / kMillisecond;
  if (local) time = ranges_->instantOfLocal(time, RepeatedTime::last);
  const ZoneRange& range = ranges_->at(time);
  const double offset = local ? date / kMillisecond - time : range.offset;
  saving = millisecondsOf(range.daylight);
  raw = millisecondsOf(offset) - saving;
}

int32_t FormatterZone::getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t,
                                 int32_t milliseconds, UErrorCode& status) const {
  using namespace std::chrono;
  const std::chrono::year_month_day date(std::chrono::year(era == 0 ? 1 - year : year),
                                         std::chrono::month(static_cast<unsigned>(month) + 1),
                                         std::chrono::day(static_cast<unsigned>(day)));
  int32_t raw = 0;
  int32_t saving = 0;
  getOffset(sys_days(date).time_since_epoch().count() * 86400e3 + milliseconds, true, raw, saving, status);
  return raw + saving;
}

int32_t FormatterZone::getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t weekday,
                                 int32_t milliseconds, int32_t, UErrorCode& status) const {
  return getOffset(era, year, month, day, weekday, milliseconds, status);
}

int32_t FormatterZone::getRawOffset() const {
  const ZoneRange& range = ranges_->at(secondsNow());
  return millisecondsOf(range.offset - range.daylight);
}

UBool FormatterZone::useDaylightTime() const {
  const ZoneRange now = ranges_->at(secondsNow());
  return now.daylight != 0 || (now.to != kEver && ranges_->at(now.to).daylight != 0);
}

UBool FormatterZone::inDaylightTime(UDate date, UErrorCode&) const {
  return ranges_->at(date / kMillisecond).daylight != 0;
}

UBool FormatterZone::hasSameRules(const icu::TimeZone& other) const {
  const auto* zone = dynamic_cast<const FormatterZone*>(&other);
  return zone != nullptr && zone->ranges_ == ranges_;
}

UClassID FormatterZone::getDynamicClassID() const {
  static char id;
  return &id;
}

}  // namespace

template <>
icu::TimeZone* newFormatterZone<icu::TimeZone>() {
  return new FormatterZone(icu::UnicodeString::fromUTF8(currentRegion().timeZone), currentZoneRanges());
}

}  // namespace ax::formatting
