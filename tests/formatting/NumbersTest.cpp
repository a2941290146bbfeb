#include "platform/formatting/Numbers.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "platform/formatting/Durations.h"
#include "tests/formatting/RegionScope.h"

namespace ax::formatting {

TEST(NumbersTest, RoundHalfAwayFromZeroWithoutTrailingZeros) {
  const RegionScope scope("en_US");
  const struct {
    double value;
    int digits;
    const char* text;
  } cases[] = {
      {0.5, 0, "1"},         {2.5, 0, "3"},      {-2.5, 0, "−3"}, {-0.4, 0, "0"},
      {-0.0, 2, "0"},        {1.005, 2, "1.01"}, {1.5, 2, "1.5"}, {1234567.891, 2, "1,234,567.89"},
      {999.999, 2, "1,000"}, {12.3f, 2, "12.3"}, {7, -4, "7"},    {1e21, 0, "1,000,000,000,000,000,000,000"}};
  for (const auto& c : cases) EXPECT_EQ(decimalString(c.value, c.digits), c.text) << c.value;
}

TEST(NumbersTest, PercentagesAreWhole) {
  const RegionScope scope("en_US");
  EXPECT_EQ(percentString(1.0), "100%");
  EXPECT_EQ(percentString(1.5f), "150%");
  EXPECT_EQ(percentString(0.285), "29%");
  EXPECT_EQ(percentString(-0.001), "0%");
  EXPECT_EQ(percentString(12.345), "1,235%");
}

TEST(NumbersTest, FollowTheRegion) {
  const struct {
    const char* locale;
    const char* decimal;
    const char* grouped;
    const char* plain;
    const char* percent;
  } cases[] = {{"en_US", "12,345.5", "−12,345", "2026", "45%"},
               {"de_DE", "12.345,5", "−12.345", "2026", "45 %"},
               {"fr_FR", "12 345,5", "−12 345", "2026", "45 %"},
               {"es_ES", "12.345,5", "−12.345", "2026", "45 %"},
               {"ja_JP", "12,345.5", "−12,345", "2026", "45%"},
               {"ar_EG", "١٢٬٣٤٥٫٥", "\u061C\u2212١٢٬٣٤٥", "٢٠٢٦", "٤٥٪\u061C"}};
  for (const auto& c : cases) {
    const RegionScope scope(c.locale);
    EXPECT_EQ(plainSpaces(decimalString(12345.5, 2)), c.decimal) << c.locale;
    EXPECT_EQ(plainSpaces(integerString(-12345)), c.grouped) << c.locale;
    EXPECT_EQ(plainIntegerString(2026), c.plain) << c.locale;
    EXPECT_EQ(plainSpaces(percentString(0.45)), c.percent) << c.locale;
  }
}

TEST(NumbersTest, StandTheEndsOfTheirTypes) {
  const RegionScope scope("en_US");
  const double infinity = std::numeric_limits<double>::infinity();
  EXPECT_EQ(decimalString(std::nan(""), 2), "no value");
  EXPECT_EQ(decimalString(-infinity, 0), "no value");
  EXPECT_EQ(percentString(infinity), "no value");
  EXPECT_EQ(integerString(std::numeric_limits<std::int64_t>::min()), "−9,223,372,036,854,775,808");
}

TEST(NumbersTest, ParseOnlyWholeTexts) {
  const RegionScope english("en_US");
  EXPECT_EQ(parseNumber("1,234.5"), 1234.5);
  EXPECT_EQ(parseNumber("-3"), -3.0);
  EXPECT_EQ(parseNumber("−3"), -3.0);
  EXPECT_EQ(parseNumber("1234567"), 1234567.0);
  for (const char* text : {"", "12a", "12,34", "1.2.3", " 3", "three", "∞", "NaN", "-"}) {
    EXPECT_EQ(parseNumber(text), std::nullopt) << text;
  }
  const RegionScope german("de_DE");
  EXPECT_EQ(parseNumber("1.234,5"), 1234.5);
  EXPECT_EQ(parseNumber("1.5"), std::nullopt);
  const RegionScope arabic("ar_EG");
  EXPECT_EQ(parseNumber("١٢٫٥"), 12.5);
  EXPECT_EQ(parseNumber("12"), 12.0);
}

TEST(DurationsTest, LeaveOutZeroPartsAndCarry) {
  const RegionScope scope("en_US");
  const struct {
    double seconds;
    const char* text;
  } cases[] = {{0, "0 minutes"},
               {0.4, "0 minutes"},
               {1, "1 second"},
               {59.5, "1 minute"},
               {3599.5, "1 hour"},
               {3605, "1 hour, 5 seconds"},
               {3903, "1 hour, 5 minutes, 3 seconds"},
               {90000, "25 hours"},
               {-61, "−1 minute, −1 second"},
               {-3660, "−1 hour, −1 minute"},
               {std::nan(""), "no value"},
               {std::numeric_limits<double>::infinity(), "no value"}};
  for (const auto& c : cases) EXPECT_EQ(spokenDuration(c.seconds), c.text) << c.seconds;
  EXPECT_FALSE(spokenDuration(1e300).empty());
}

TEST(DurationsTest, CountInHours) {
  const RegionScope scope("en_US");
  EXPECT_EQ(spokenHours(0), "0 minutes");
  EXPECT_EQ(spokenHours(0.5), "30 minutes");
  EXPECT_EQ(spokenHours(2.25), "2 hours, 15 minutes");
  EXPECT_EQ(spokenHours(0.999), "1 hour");
  EXPECT_EQ(spokenHours(1.7f), "1 hour, 42 minutes");
  EXPECT_EQ(spokenHours(std::nan("")), "no value");
  EXPECT_EQ(spokenMinutes(7384), "123 minutes, 4 seconds");
  EXPECT_EQ(spokenMinutes(0.4), "0 minutes");
  EXPECT_FALSE(spokenHours(-1e300).empty());
}

TEST(DurationsTest, TakeThePluralFormsOfTheLanguage) {
  const struct {
    const char* locale;
    const char* one;
    const char* two;
    const char* all;
    const char* nothing;
  } cases[] = {{"de_DE", "1 Stunde", "2 Stunden", "1 Stunde, 5 Minuten und 3 Sekunden", "0 Minuten"},
               {"fr_FR", "1 heure", "2 heures", "1 heure, 5 minutes et 3 secondes", "0 minute"},
               {"es_ES", "1 hora", "2 horas", "1 hora, 5 minutos y 3 segundos", "0 minutos"},
               {"ja_JP", "1時間", "2時間", "1時間5分3秒", "0分"},
               {"ar_EG", "ساعة واحدة", "ساعتان", "ساعة واحدة و٥ دقائق و٣ ثوانٍ", "٠ دقيقة"}};
  for (const auto& c : cases) {
    const RegionScope scope(c.locale);
    EXPECT_EQ(plainSpaces(spokenHours(1)), c.one);
    EXPECT_EQ(plainSpaces(spokenHours(2)), c.two);
    EXPECT_EQ(plainSpaces(spokenDuration(3903)), c.all);
    EXPECT_EQ(plainSpaces(spokenDuration(0)), c.nothing);
  }
  const RegionScope arabic("ar_EG");
  EXPECT_EQ(spokenHours(3), "٣ ساعات");
  EXPECT_EQ(spokenHours(11), "١١ ساعة");
  EXPECT_EQ(spokenDuration(-61), "ناقص دقيقة واحدة وناقص ثانية واحدة");
  const RegionScope german("de_DE");
  EXPECT_EQ(spokenDuration(318), "5 Minuten und 18 Sekunden");
}

}  // namespace ax::formatting
