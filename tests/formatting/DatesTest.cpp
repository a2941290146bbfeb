#include "platform/formatting/Dates.h"

#include <gtest/gtest.h>

#include <limits>

#include "platform/formatting/CalendarMath.h"
#include "platform/formatting/DateIntervals.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

constexpr double kInfinity = std::numeric_limits<double>::infinity();

TEST(DatesTest, OrderFieldsAsTheRegionDoes) {
  const struct {
    const char* locale;
    const char* weekday;
    const char* dayOfMonth;
    const char* whole;
  } cases[] = {{"en_US", "Sunday", "March 8", "Sunday, March 8, 2026"},
               {"de_DE", "Sonntag", "8. März", "Sonntag, 8. März 2026"},
               {"fr_FR", "dimanche", "8 mars", "dimanche 8 mars 2026"},
               {"es_ES", "domingo", "8 de marzo", "domingo, 8 de marzo de 2026"},
               {"ja_JP", "日曜日", "3月8日", "2026年3月8日日曜日"},
               {"ar_EG", "الأحد", "٨ مارس", "الأحد، ٨ مارس ٢٠٢٦"}};
  for (const auto& c : cases) {
    const RegionScope scope(c.locale);
    const double time = *timeFromIso("2026-03-08T14:30:00Z");
    EXPECT_EQ(dateString(time, "EEEE"), c.weekday);
    EXPECT_EQ(dateString(time, "dMMMM"), c.dayOfMonth);
    EXPECT_EQ(dateString(time, "EEEE, MMM d, yyyy"), c.whole);
  }
}

TEST(DatesTest, AreWrittenToBeSpoken) {
  const double first = *timeFromIso("2026-03-01T09:05:00Z");
  const RegionScope scope("fr_FR");
  EXPECT_EQ(dateString(first, "dMMMM"), "1er mars");
  EXPECT_EQ(dateString(first, "EEE, MMM d, yyyy"), "dimanche 1er mars 2026");
  EXPECT_EQ(dateString(first + 10 * 86400, "dMMMM"), "11 mars");
  EXPECT_EQ(plainSpaces(dateString(first, "h:mma")), "9:05");
  setCurrentRegion({"en_US", "UTC"});
  EXPECT_EQ(plainSpaces(dateString(first, "HHmm")), "9:05 AM");
  EXPECT_EQ(dateString(first, "MMyyyy"), "03/2026");
}

TEST(DatesTest, BelongToTheZoneAndTheGregorianCalendar) {
  const double time = *timeFromIso("2026-03-08T02:00:00Z");
  const RegionScope newYork("en_US", "America/New_York");
  EXPECT_EQ(dateString(time, "EEEE"), "Saturday");
  setCurrentRegion({"en_US", "Asia/Kathmandu"});
  EXPECT_EQ(dateString(time, "EEEE"), "Sunday");
  setCurrentRegion({"th_TH", "UTC"});
  EXPECT_NE(dateString(time, "yyyy").find("2026"), std::string::npos);
}

TEST(DatesTest, HaveFourStyles) {
  const RegionScope scope("en_US");
  const double time = *timeFromIso("2026-03-08");
  EXPECT_EQ(dateStyleString(time, DateStyle::shortStyle), "3/8/26");
  EXPECT_EQ(dateStyleString(time, DateStyle::mediumStyle), "March 8, 2026");
  EXPECT_EQ(dateStyleString(time, DateStyle::longStyle), "March 8, 2026");
  EXPECT_EQ(dateStyleString(time, DateStyle::fullStyle), "Sunday, March 8, 2026");
  EXPECT_EQ(dateStyleString(time, DateStyle{9}), "");
  const RegionScope japan("ja_JP");
  EXPECT_EQ(dateStyleString(time, DateStyle::mediumStyle), "2026年3月8日");
  const RegionScope france("fr_FR");
  EXPECT_EQ(dateStyleString(*timeFromIso("2026-03-01"), DateStyle::mediumStyle), "1er mars 2026");
}

TEST(DatesTest, WithoutATimeAreEmpty) {
  EXPECT_EQ(dateString(kInfinity, "EEEE"), "");
  EXPECT_EQ(dateString(std::numeric_limits<double>::quiet_NaN(), "EEEE"), "");
  EXPECT_EQ(dateString(0, ""), "");
  EXPECT_EQ(dateIntervalString(0, kInfinity, "ha"), "");
}

TEST(DatesTest, ReadMonthNumbersAndNothingElse) {
  for (const char* locale : {"en_US", "ar_EG", "ja_JP"}) {
    const RegionScope scope(locale, "America/New_York");
    EXPECT_EQ(parseDate("3", "MM"), timeFromIso("2000-03-01T12:00:00")) << locale;
    EXPECT_EQ(parseDate("03", "MM"), timeFromIso("2000-03-01T12:00:00")) << locale;
    EXPECT_EQ(parseDate("٣", "MM"), timeFromIso("2000-03-01T12:00:00")) << locale;
    EXPECT_EQ(parseDate("12", "MM"), timeFromIso("2000-12-01T12:00:00")) << locale;
    for (const char* text : {"", "0", "13", "-3", "3x", "x"})
      EXPECT_EQ(parseDate(text, "MM"), std::nullopt) << text;
  }
}

TEST(DatesTest, ReadMonthsWhoseFirstMidnightWasSkipped) {
  const RegionScope scope("en_US", "Asia/Damascus");
  ASSERT_TRUE(parseDate("04", "MM"));
  EXPECT_EQ(dateString(*parseDate("04", "MM"), "MMMM"), "April");
}

TEST(DatesTest, ReadWholeDates) {
  const RegionScope scope("en_US", "Europe/Berlin");
  EXPECT_EQ(parseDate("2026-03-29", "yyyy-MM-dd"), timeFromIso("2026-03-29T12:00:00"));
  EXPECT_EQ(parseDate("2026-02-30", "yyyy-MM-dd"), std::nullopt);
  EXPECT_EQ(parseDate("March 49", "MMMM yy"), timeFromIso("2049-03-01T12:00:00"));
  EXPECT_EQ(parseDate("March 50", "MMMM yy"), timeFromIso("1950-03-01T12:00:00"));
}

TEST(DatesTest, NameTheWeekdays) {
  const RegionScope scope("en_US");
  ASSERT_EQ(weekdaySymbols().size(), 7u);
  EXPECT_EQ(weekdaySymbols().front(), "Sunday");
  EXPECT_EQ(&standaloneWeekdaySymbols(), &standaloneWeekdaySymbols());
  setCurrentRegion({"fr_FR", "UTC"});
  ASSERT_EQ(standaloneWeekdaySymbols().size(), 7u);
  EXPECT_EQ(standaloneWeekdaySymbols().back(), "samedi");
  EXPECT_EQ(weekdaySymbols().back(), "samedi");
}

TEST(DateIntervalsTest, SayOnceWhatBothEndsShare) {
  const RegionScope scope("en_US", "America/New_York");
  const auto span = [](const char* start, const char* end, const char* dateTemplate) {
    return plainSpaces(dateIntervalString(*timeFromIso(start), *timeFromIso(end), dateTemplate));
  };
  EXPECT_EQ(span("2026-03-07T00:00:00", "2026-03-07T03:00:00", "hxa"), "12 – 3 AM");
  EXPECT_EQ(span("2026-03-07T09:00:00", "2026-03-07T12:00:00", "hxa"), "9 AM – 12 PM");
  EXPECT_EQ(span("2026-03-07T21:00:00", "2026-03-07T23:59:59", "h:mma"), "9:00 – 11:59 PM");
  EXPECT_EQ(span("2026-03-01T00:00:00", "2026-03-31T00:00:00", "MMMMdyyyy"), "March 1 – 31, 2026");
  EXPECT_EQ(span("2025-12-31T00:00:00", "2026-01-06T00:00:00", "MMMMdyyyy"),
            "December 31, 2025 – January 6, 2026");
  EXPECT_EQ(span("2026-03-07T02:00:00", "2026-03-07T02:00:00", "hxa"), "2 AM");
  EXPECT_EQ(span("2026-11-01T01:00:00-04:00", "2026-11-01T01:00:00-05:00", "hxa"), "1 AM");
  EXPECT_EQ(span("2026-03-07T05:00:00", "2026-03-07T02:00:00", "ha"), "5 – 2 AM");
}

TEST(DateIntervalsTest, FollowTheLanguage) {
  const struct {
    const char* locale;
    const char* hours;
    const char* days;
  } cases[] = {{"de_DE", "0–3 Uhr", "1.–4. Januar 1970"},
               {"fr_FR", "0:00 – 3:00", "1er–4 janvier 1970"},
               {"es_ES", "0:00–3:00", "1–4 de enero de 1970"},
               {"ja_JP", "0時～3時", "1970年1月1日～4日"},
               {"ar_EG", "١٢–٣ صباحًا", "١–٤ يناير، ١٩٧٠"}};
  for (const auto& c : cases) {
    const RegionScope scope(c.locale);
    EXPECT_EQ(plainSpaces(dateIntervalString(0, 10800, "hxa")), c.hours);
    EXPECT_EQ(dateIntervalString(0, 3 * 86400, "MMMMdyyyy"), c.days);
  }
}

TEST(DateIntervalsTest, NameTheDaysThatTheirHoursLieIn) {
  const RegionScope scope("en_US");
  const double evening = *timeFromIso("2026-12-30T22:00:00Z");
  EXPECT_EQ(plainSpaces(dateIntervalString(evening, evening + 10800, "h:mma")),
            "December 30 at 10:00 PM – December 31 at 1:00 AM");
  EXPECT_EQ(plainSpaces(dateIntervalString(evening + 86400, evening + 97200, "ha")),
            "December 31, 2026 at 10 PM – January 1, 2027 at 1 AM");
  setCurrentRegion({"de_DE", "UTC"});
  EXPECT_EQ(plainSpaces(dateIntervalString(evening - 50400, evening - 46800, "h:mma")), "8:00–9:00 Uhr");
}

}  // namespace ax::formatting
