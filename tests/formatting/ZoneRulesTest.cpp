#include "platform/formatting/ZoneRules.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <ctime>
#include <optional>
#include <string>

#include "platform/formatting/CalendarMath.h"
#include "platform/formatting/Dates.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

namespace {

constexpr double kDay = 86400;

const char* const kZones[] = {"Africa/Cairo",         "Africa/Casablanca",     "Africa/El_Aaiun",
                              "Africa/Juba",          "America/Asuncion",      "America/Bogota",
                              "America/Chihuahua",    "America/Havana",        "America/Mexico_City",
                              "America/New_York",     "America/Nuuk",          "America/Sao_Paulo",
                              "America/Scoresbysund", "Antarctica/Troll",      "Asia/Almaty",
                              "Asia/Amman",           "Asia/Beirut",           "Asia/Gaza",
                              "Asia/Kathmandu",       "Asia/Tehran",           "Asia/Tokyo",
                              "Australia/Lord_Howe",  "Europe/Berlin",         "Europe/Dublin",
                              "Europe/Volgograd",     "Pacific/Apia",          "Pacific/Chatham",
                              "Pacific/Fiji",         "America/Ciudad_Juarez", "Etc/GMT+5"};

// The C library's zone, which reads the system's files on its own.
class LibraryZone {
 public:
  explicit LibraryZone(const char* name) {
    setenv("TZ", name, 1);
    tzset();
  }
  ~LibraryZone() {
    unsetenv("TZ");
    tzset();
  }
  LibraryZone(const LibraryZone&) = delete;
  LibraryZone& operator=(const LibraryZone&) = delete;

  std::tm clockAt(double time) const {
    const auto seconds = static_cast<std::time_t>(time);
    std::tm fields{};
    localtime_r(&seconds, &fields);
    return fields;
  }
  double offsetAt(double time) const { return static_cast<double>(clockAt(time).tm_gmtoff); }

  // The first second with the offset that `to` has.
  double changeBetween(double from, double to) const {
    const double after = offsetAt(to);
    while (to - from > 1) {
      const double middle = std::floor((from + to) / 2);
      (offsetAt(middle) == after ? to : from) = middle;
    }
    return to;
  }
};

// What the clock shows, as the formatter writes it and as the C library counts it.
void expectSameClock(const LibraryZone& library, double time, const char* zone) {
  const std::tm fields = library.clockAt(time);
  ASSERT_EQ(zoneOffset(time), static_cast<double>(fields.tm_gmtoff)) << zone << " " << isoWithOffset(time);
  char text[16];
  std::strftime(text, sizeof text, ":%M:%S", &fields);
  ASSERT_EQ(dateString(time, "HHmmss"), std::to_string(fields.tm_hour) + text)
      << zone << " " << isoWithOffset(time);
}

int compareYears(const char* zone, int first, int last) {
  const RegionScope scope("en_GB", zone);
  const LibraryZone library(zone);
  const double end = timeFromIso(std::to_string(last) + "-01-01T00:00:00Z").value();
  double before = timeFromIso(std::to_string(first) + "-01-01T00:00:00Z").value();
  int changes = 0;
  for (double time = before + kDay / 4; time < end; before = time, time += kDay / 4) {
    EXPECT_EQ(zoneOffset(time), library.offsetAt(time)) << zone << " " << isoWithOffset(time);
    if (library.offsetAt(before) == library.offsetAt(time)) continue;
    const double change = library.changeBetween(before, time);
    expectSameClock(library, change - 1, zone);
    expectSameClock(library, change, zone);
    ++changes;
  }
  return changes;
}

}  // namespace

TEST(ZoneRulesTest, AreTheSystemsAtEveryChange) {
  int changes = 0;
  for (const char* zone : kZones) {
    changes += compareYears(zone, 2019, 2030);
    if (HasFailure()) break;
  }
  EXPECT_GT(changes, 250);
}

// Where the files list no more changes, one rule holds for ever.
TEST(ZoneRulesTest, AreTheSystemsAfterTheLastChangeListed) {
  for (const char* zone : kZones) {
    compareYears(zone, 2036, 2039);
    compareYears(zone, 2086, 2089);
    if (HasFailure()) break;
  }
}

TEST(ZoneRulesTest, TellDaylightSavingAlsoWhereWinterIsMarked) {
  const struct {
    const char* zone;
    const char* summer;
    double daylight;
    double winter = 0;
  } cases[] = {{"Europe/Berlin", "2026-07-01T12:00:00Z", 3600},
               {"America/New_York", "2055-07-01T12:00:00Z", 3600},
               {"Australia/Lord_Howe", "2026-01-01T12:00:00Z", 1800},
               {"Antarctica/Troll", "2026-07-01T12:00:00Z", 7200},
               {"Europe/Dublin", "2026-07-01T12:00:00Z", 3600},
               {"Europe/Dublin", "2055-07-01T12:00:00Z", 3600},
               {"Europe/London", "1943-07-01T12:00:00Z", 7200, 3600},
               {"Pacific/Apia", "2012-01-15T12:00:00Z", 3600},
               {"Asia/Tokyo", "2026-07-01T12:00:00Z", 0}};
  for (const auto& c : cases) {
    const RegionScope scope("en_GB", c.zone);
    const double summer = timeFromIso(c.summer).value();
    EXPECT_EQ(daylightSavingOffset(summer), c.daylight) << c.zone;
    const double winter = summer + 182 * kDay;
    EXPECT_EQ(zoneOffset(summer) - zoneOffset(winter), c.daylight - daylightSavingOffset(winter)) << c.zone;
    EXPECT_EQ(daylightSavingOffset(winter), c.winter) << c.zone;
  }
}

// ICU knows names that the system has no file for.
TEST(ZoneRulesTest, AreIcusWhereTheSystemHasNone) {
  EXPECT_EQ(systemZoneRules("PST"), nullptr);
  EXPECT_EQ(systemZoneRules("GMT+5:30"), nullptr);
  EXPECT_EQ(systemZoneRules("localtime"), nullptr);
  EXPECT_EQ(systemZoneRules("../zoneinfo/UTC"), nullptr);
  const RegionScope scope("en_GB", "PST");
  EXPECT_EQ(isoWithOffset(timeFromIso("2026-07-01T12:00:00").value()), "2026-07-01T12:00:00-07:00");
  setCurrentRegion({"en_GB", "GMT+5:30"});
  EXPECT_EQ(dateString(0, "HHmm"), "5:30");
}

TEST(ZoneRulesTest, ReadDatesByThem) {
  const RegionScope scope("en_GB", "Africa/Cairo");
  EXPECT_EQ(parseDate("2026-04-24 00:30", "yyyy-MM-dd HH:mm"), std::nullopt) << "it never comes";
  EXPECT_EQ(isoWithOffset(parseDate("2026-10-29 23:30", "yyyy-MM-dd HH:mm").value()),
            "2026-10-29T23:30:00+02:00");
  EXPECT_EQ(isoWithOffset(parseDate("2026-07-01 12:00", "yyyy-MM-dd HH:mm").value()),
            "2026-07-01T12:00:00+03:00");
}

}  // namespace ax::formatting
