#include "platform/formatting/Region.h"

#include <gtest/gtest.h>

#include "platform/formatting/DateIntervals.h"
#include "platform/formatting/Dates.h"
#include "platform/formatting/Durations.h"
#include "platform/formatting/FormatterStatistics.h"
#include "platform/formatting/Lists.h"
#include "platform/formatting/MessagePattern.h"
#include "platform/formatting/Numbers.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

TEST(RegionTest, ReplacesWhatIsNotKnown) {
  RegionScope scope("xx_YY", "Mars/Olympus");
  EXPECT_EQ(currentRegion(), (Region{"en_US", "UTC"}));
  setCurrentRegion({"", "Asia/Kathmandu"});
  EXPECT_EQ(currentRegion(), (Region{"en_US", "Asia/Kathmandu"}));
}

TEST(RegionTest, TellsLanguageDirectionAndSeparator) {
  const RegionScope english("en_US");
  EXPECT_EQ(currentLanguage(), "en");
  EXPECT_FALSE(currentLanguageIsRightToLeft());
  EXPECT_EQ(listSeparator(), ", ");
  const RegionScope arabic("ar_EG");
  EXPECT_EQ(currentLanguage(), "ar");
  EXPECT_TRUE(currentLanguageIsRightToLeft());
  EXPECT_EQ(listSeparator(), "، ");
  const RegionScope japanese("ja_JP");
  EXPECT_EQ(listSeparator(), "、");
}

TEST(RegionTest, KnowsLocalesAndZones) {
  for (const char* locale : {"en", "de_AT", "pt-BR", "ar_EG", "zh_Hant_TW"})
    EXPECT_TRUE(isKnownLocale(locale));
  for (const char* locale : {"", "english", "xx", "../de", "C"})
    EXPECT_FALSE(isKnownLocale(locale)) << locale;
  EXPECT_FALSE(isKnownLocale({"en\0x", 4}));
  for (const char* zone : {"UTC", "Asia/Kathmandu", "GMT+5"}) EXPECT_TRUE(isKnownTimeZone(zone)) << zone;
  for (const char* zone : {"", "Mars/Olympus", "UTC2", "new york"})
    EXPECT_FALSE(isKnownTimeZone(zone)) << zone;
}

namespace {

void useEveryFormatter() {
  for (int day = 0; day < 3; ++day) {
    const double time = 1e9 + day * 86400;
    dateString(time, "EEEE");
    dateString(time, "dMMMM");
    dateStyleString(time, DateStyle::fullStyle);
    dateIntervalString(time, time + 3600, "ha");
    parseDate("3", "MM");
    decimalString(day, 0);
    decimalString(day, 2);
    integerString(day);
    plainIntegerString(day);
    percentString(day);
    parseNumber("3");
    spokenDuration(day);
    spokenHours(day);
    formatMessage("{0, plural, one {# day} other {# days}}", {std::int64_t{day}});
    formatMessage("{0}: {1}", {std::int64_t{day}, std::string("x")});
  }
}

}  // namespace

TEST(FormatterCacheTest, MakesNothingWhenWarmAndIsEmptiedByTheRegion) {
  const RegionScope scope("fr_FR", "Europe/Berlin");
  EXPECT_EQ(formattersHeld(), 0u);
  useEveryFormatter();
  const auto made = formattersMade();
  useEveryFormatter();
  EXPECT_EQ(formattersMade(), made);
  setCurrentRegion(currentRegion());
  EXPECT_EQ(formattersHeld(), 0u);
  useEveryFormatter();
  EXPECT_GT(formattersMade(), made);
}

TEST(FormatterCacheTest, StaysBoundedAndKeepsWhatIsUsed) {
  const RegionScope scope("en_US");
  formatMessage("kept {0}", {std::int64_t{0}});
  for (std::int64_t i = 0; i < 1000; ++i) {
    EXPECT_EQ(formatMessage("number " + std::to_string(i) + " is {0}", {std::string("x")}),
              "number " + std::to_string(i) + " is x");
    const auto made = formattersMade();
    formatMessage("kept {0}", {std::string("y")});
    ASSERT_EQ(formattersMade(), made) << i;
  }
  EXPECT_LE(formattersHeld(), 256u);
}

}  // namespace ax::formatting
