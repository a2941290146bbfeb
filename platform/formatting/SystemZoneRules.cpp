#include <date/tz.h>

#include <algorithm>
#include <cmath>
#include <exception>
#include <fstream>
#include <iterator>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/formatting/YearlyRule.h"
#include "platform/formatting/ZoneRules.h"

namespace ax::formatting {
namespace {

constexpr double kYear = 366 * 86400.0;
constexpr const char* kFolder = "/usr/share/zoneinfo/";

// A zone's file lists its changes up to some year; its last line tells the rule from there on.
std::optional<YearlyRule> laterRule(const std::string& name) {
  std::ifstream file(kFolder + name, std::ios::binary);
  const std::string bytes{std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
  if (bytes.size() < 2 || bytes.back() != '\n') return std::nullopt;
  const std::size_t before = bytes.rfind('\n', bytes.size() - 2);
  if (before == std::string::npos) return std::nullopt;
  return YearlyRule::read(std::string_view(bytes).substr(before + 1, bytes.size() - before - 2));
}

MarkedStretch stretchOf(const date::sys_info& info) {
  using date::year;
  const auto seconds = [](date::sys_seconds time) {
    return static_cast<double>(time.time_since_epoch().count());
  };
  const bool always = info.begin <= date::sys_days(year::min() / 1 / 1);
  const bool forever = info.end >= date::sys_days(year::max() / 12 / 31);
  return {always ? -kEver : seconds(info.begin), forever ? kEver : seconds(info.end),
          static_cast<double>(info.offset.count()), info.save != std::chrono::minutes(0)};
}

// Copied from the library, whose tables end with the process's static objects: texts are formatted until
// then.
std::vector<MarkedStretch> listedStretches(const date::time_zone& zone) {
  std::vector<MarkedStretch> stretches;
  date::sys_seconds next = date::sys_days(date::year::min() / 1 / 1);
  do {
    const date::sys_info info = zone.get_info(next);
    const MarkedStretch stretch = stretchOf(info);
    const bool goesOn = !stretches.empty() && stretches.back().offset == stretch.offset &&
                        stretches.back().marked == stretch.marked;
    if (!goesOn) stretches.push_back(stretch);
    stretches.back().to = stretch.to;
    next = info.end;
  } while (stretches.back().to != kEver);
  return stretches;
}

enum class Side { before, after };

class SystemZoneRules final : public ZoneRules {
 public:
  explicit SystemZoneRules(const date::time_zone& zone)
      : listed_(listedStretches(zone)), later_(laterRule(zone.name())) {}

  ZoneRange rangeAt(double time) const override;

 private:
  MarkedStretch stretchAt(double time) const;
  MarkedStretch standardBeside(const MarkedStretch& stretch, Side side) const;
  double markedSaving(const MarkedStretch& stretch) const;
  double daylightOf(const MarkedStretch& stretch) const;

  std::vector<MarkedStretch> listed_;  // without gaps, from ever to ever
  std::optional<YearlyRule> later_;
};

MarkedStretch SystemZoneRules::stretchAt(double time) const {
  const auto after = [](double instant, const MarkedStretch& stretch) { return instant < stretch.from; };
  const MarkedStretch& listed = *std::prev(std::upper_bound(listed_.begin() + 1, listed_.end(), time, after));
  if (listed.to != kEver || !later_) return listed;
  MarkedStretch ruled = later_->at(time);
  ruled.from = std::max(ruled.from, listed.from);
  return ruled;
}

// The nearest stretch of standard time on one side; `stretch` itself where there is none.
MarkedStretch SystemZoneRules::standardBeside(const MarkedStretch& stretch, Side side) const {
  constexpr int most = 12;  // clocks may have gone twice forward for years
  MarkedStretch beside = stretch;
  for (int i = 0; i < most && beside.marked; ++i) {
    const double edge = side == Side::before ? beside.from - 1 : beside.to;
    if (std::isinf(edge)) return stretch;
    beside = stretchAt(edge);
  }
  return beside;
}

// What a marked stretch adds to standard time: less than 0 where it is winter that is marked. The standard
// time before counts, if the zone did not change it in between, as it does where the date line moves.
double SystemZoneRules::markedSaving(const MarkedStretch& stretch) const {
  constexpr double most = 2 * 3600;
  for (const Side side : {Side::before, Side::after}) {
    const double saving = stretch.offset - standardBeside(stretch, side).offset;
    if (saving != 0 && std::abs(saving) <= most) return saving;
  }
  return 0;
}

// The files mark stretches and do not tell by how much clocks are changed.
double SystemZoneRules::daylightOf(const MarkedStretch& stretch) const {
  if (stretch.marked) return std::max(markedSaving(stretch), 0.0);
  if (stretch.to - stretch.from > kYear) return 0;
  for (const double beside : {stretch.to, stretch.from - 1}) {
    const MarkedStretch neighbor = stretchAt(beside);
    if (neighbor.marked && markedSaving(neighbor) < 0) return stretch.offset - neighbor.offset;
  }
  return 0;
}

ZoneRange SystemZoneRules::rangeAt(double time) const {
  const MarkedStretch stretch = stretchAt(time);
  const double former = stretch.from == -kEver ? stretch.offset : stretchAt(stretch.from - 1).offset;
  return {stretch.from, stretch.to, stretch.offset, daylightOf(stretch), former};
}

}  // namespace

std::unique_ptr<ZoneRules> systemZoneRules(const std::string& name) {
  if (name == "localtime") return nullptr;  // in the same folder, but it is no zone's name
  try {
    return std::make_unique<SystemZoneRules>(*date::locate_zone(name));
  } catch (const std::exception&) {
    return nullptr;
  }
}

}  // namespace ax::formatting
