#include "platform/formatting/CalendarMath.h"

#include <gtest/gtest.h>

#include <cmath>

#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

namespace {

double at(const char* iso) {
  return timeFromIso(iso).value();
}

}  // namespace

TEST(CalendarMathTest, StartsDaysAtTheirFirstInstant) {
  const struct {
    const char* zone;
    const char* instant;
    const char* start;
  } cases[] = {
      {"America/New_York", "2026-03-08T23:30:00-04:00", "2026-03-08T00:00:00-05:00"},
      {"America/New_York", "2026-11-01T23:30:00-05:00", "2026-11-01T00:00:00-04:00"},
      {"America/New_York", "2026-07-01T00:00:00-04:00", "2026-07-01T00:00:00-04:00"},
      {"America/New_York", "2026-06-30T23:59:59-04:00", "2026-06-30T00:00:00-04:00"},
      {"Asia/Kathmandu", "2026-03-08T00:10:00+05:45", "2026-03-08T00:00:00+05:45"},
      // Clocks go from 00:00 to 01:00, and from 01:00 back to 00:00.
      {"America/Havana", "2026-03-08T01:00:00-04:00", "2026-03-08T01:00:00-04:00"},
      {"America/Havana", "2026-03-08T13:00:00-04:00", "2026-03-08T01:00:00-04:00"},
      {"America/Havana", "2026-11-01T00:30:00-05:00", "2026-11-01T00:00:00-04:00"},
      {"America/Havana", "2026-11-01T12:00:00-05:00", "2026-11-01T00:00:00-04:00"},
      // Clocks go from 00:00 back to 23:00: the day before lasts an hour longer.
      {"Asia/Beirut", "2021-10-30T23:30:00+02:00", "2021-10-30T00:00:00+03:00"},
      {"Asia/Beirut", "2021-10-31T00:30:00+02:00", "2021-10-31T00:00:00+02:00"},
      // The 30th was left out.
      {"Pacific/Apia", "2011-12-31T05:00:00+14:00", "2011-12-31T00:00:00+14:00"},
  };
  for (const auto& c : cases) {
    const RegionScope scope("en_US", c.zone);
    EXPECT_EQ(startOfDay(at(c.instant)), at(c.start)) << c.zone << " " << c.instant;
    EXPECT_EQ(dayNumber(at(c.start)), dayNumber(at(c.instant))) << c.zone << " " << c.instant;
    EXPECT_EQ(dayNumber(at(c.start) - 1) + (std::string(c.zone) == "Pacific/Apia" ? 2 : 1),
              dayNumber(at(c.start)))
        << c.zone << " " << c.instant;
  }
}

TEST(CalendarMathTest, SplitsTimesIntoLocalFields) {
  const RegionScope scope("en_US", "Asia/Kathmandu");
  const CalendarFields fields = calendarFields(at("2024-02-29T18:14:59.75Z"));
  EXPECT_EQ(std::vector({fields.year, fields.month, fields.day, fields.hour, fields.minute, fields.second}),
            std::vector({2024, 2, 29, 23, 59, 59}));
  EXPECT_EQ(fields.weekday, 5);
  EXPECT_EQ(isoFromTime(-0.25), "1970-01-01T05:29:59");
  setCurrentRegion({"en_US", "UTC"});
  EXPECT_EQ(isoFromTime(-0.25), "1969-12-31T23:59:59");
  EXPECT_EQ(dayNumber(-0.25), -1);
  EXPECT_EQ(calendarFields(-86400 * 4).weekday, 1);
}

TEST(CalendarMathTest, KnowsOffsetsOnBothSidesOfAChange) {
  const RegionScope scope("en_US", "Europe/Berlin");
  const double change = at("2026-03-29T01:00:00Z");
  EXPECT_EQ(zoneOffset(change - 0.001), 3600);
  EXPECT_EQ(daylightSavingOffset(change - 0.001), 0);
  EXPECT_EQ(zoneOffset(change), 7200);
  EXPECT_EQ(daylightSavingOffset(change), 3600);
  setCurrentRegion({"en_US", "Asia/Kathmandu"});
  EXPECT_EQ(zoneOffset(change), 20700);
  EXPECT_EQ(daylightSavingOffset(change), 0);
}

// Walks back and forth over more changes of clocks than are remembered, and compares with day
// starts taken one step at a time.
TEST(CalendarMathTest, AgreesWithItselfOverManyYears) {
  const RegionScope scope("en_US", "America/Havana");
  const double first = at("1990-01-01T12:00:00");
  for (int i = 0; i < 12000; ++i) {
    const double time = first + 86400.0 * (i % 2 == 0 ? i : 12000 - i);
    const double start = startOfDay(time);
    ASSERT_LE(start, time);
    ASSERT_EQ(dayNumber(start), dayNumber(time)) << isoWithOffset(time);
    ASSERT_LT(dayNumber(start - 1), dayNumber(time)) << isoWithOffset(time);
    ASSERT_EQ(timeFromIso(isoWithOffset(time)), time);
  }
}

TEST(CalendarMathTest, StandsTimesThatAreNone) {
  const RegionScope scope("en_US", "America/New_York");
  for (const double time : {std::nan(""), HUGE_VAL, -HUGE_VAL, 1e300}) {
    EXPECT_TRUE(std::isfinite(startOfDay(time)));
    EXPECT_GE(calendarFields(time).weekday, 1);
    EXPECT_FALSE(isoWithOffset(time).empty());
  }
}

TEST(IsoTimeTest, ReadsLocalTimesAndOffsets) {
  const RegionScope scope("en_US", "America/New_York");
  EXPECT_EQ(timeFromIso("2026-03-07T12:00:00"), 1772902800.0);
  EXPECT_EQ(timeFromIso("2026-03-07T12:00:00"), timeFromIso("2026-03-07T17:00:00Z"));
  EXPECT_EQ(timeFromIso("2026-03-07T12:00:00"), timeFromIso("2026-03-07T19:00:00+0200"));
  EXPECT_EQ(timeFromIso("2026-03-07T12:00:00"), timeFromIso("2026-03-07T22:45:00+05:45"));
  EXPECT_EQ(timeFromIso("2026-03-07"), timeFromIso("2026-03-07T05:00:00Z"));
  EXPECT_EQ(timeFromIso("1970-01-01T00:00:00.1234567890123456789Z"), 0.123456789012345);
  EXPECT_EQ(timeFromIso("1969-12-31T23:59:58.125Z"), -1.875);
  for (const char* text :
       {"2026-03-07T17:00Z", "2026-03-07 17:00:00z", "2026-03-07t18:00:00,0+01", "2026-03-07T16:59:60Z"}) {
    EXPECT_EQ(timeFromIso(text), 1772902800.0) << text;
  }
  // 02:30 never came; 01:30 came twice.
  EXPECT_EQ(isoWithOffset(at("2026-03-08T02:30:00")), "2026-03-08T03:30:00-04:00");
  EXPECT_EQ(isoWithOffset(at("2026-11-01T01:30:00")), "2026-11-01T01:30:00-05:00");
  setCurrentRegion({"en_US", "America/Havana"});
  EXPECT_EQ(isoWithOffset(at("2026-11-01")), "2026-11-01T00:00:00-04:00");
  EXPECT_EQ(isoWithOffset(at("2026-03-08")), "2026-03-08T01:00:00-04:00");
}

TEST(IsoTimeTest, RefusesEverythingElse) {
  for (const char* text : {"",
                           "2026",
                           "2026-02-30",
                           "2025-02-29",
                           "2026-13-01",
                           "2026-00-10",
                           "2026-3-8",
                           "26-03-08",
                           "2026-03-08T",
                           "2026-03-08T25:00:00",
                           "2026-03-08T24:00:00",
                           "2026-03-08T10:60:00",
                           "2026-03-08T10:00:61",
                           "2026-03-08T10:",
                           "2026-03-08T10:-1",
                           "2026-03-08  10:00:00",
                           "2026-03-08T10:00:00.",
                           "2026-03-08T10:00:00+",
                           "2026-03-08Z",
                           "2026-03-08T10:00:00+2:00",
                           "2026-03-08T10:00:00+02:60",
                           "2026-03-08T10:00:00Zx",
                           " 2026-03-08",
                           "2026-03-08 ",
                           "-026-03-08",
                           "now"}) {
    EXPECT_EQ(timeFromIso(text), std::nullopt) << text;
  }
}

}  // namespace ax::formatting
