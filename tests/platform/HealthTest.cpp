#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "platform/foundation/Environment.h"
#include "platform/foundation/Formatters.h"
#include "platform/health/ActivitySummary.h"
#include "platform/health/HealthStore.h"
#include "platform/health/Quantity.h"
#include "platform/runtime/KeyReading.h"
#include "platform/runtime/Number.h"
#include "tests/formatting/RegionScope.h"

namespace ax {

namespace {

TEST(UnitTest, Converts) {
  const struct {
    double value;
    const char* from;
    const char* to;
    double result;
  } cases[] = {{1, "kcal", "cal", 1000},  {418.4, "kJ", "kcal", 100},         {1.5, "hr", "min", 90},
               {1, "mi", "km", 1.609344}, {72, "count/min", "count/s", 1.2},  {6, "min/km", "s/m", 0.36},
               {50, "%", "count", 0.5},   {42, "ml/kg/min", "L/kg/hr", 2.52}, {10, "lb", "kg", 4.5359237}};
  for (const auto& c : cases) {
    const Ref<Quantity> amount = quantity(c.value, Unit::unitFromString(c.from));
    EXPECT_NEAR(amount->doubleValueForUnit(Unit::unitFromString(c.to)), c.result, 1e-9) << c.from;
  }
}

TEST(UnitTest, MeasuresNothingInAnother) {
  const Ref<Quantity> energy = quantity(5, Unit::kilocalorieUnit());
  for (const char* other : {"min", "count", "kcal/min", "m"}) {
    EXPECT_FALSE(energy->isCompatibleWithUnit(Unit::unitFromString(other))) << other;
    EXPECT_EQ(energy->doubleValueForUnit(Unit::unitFromString(other)), 0) << other;
  }
  EXPECT_EQ(energy->doubleValueForUnit(nullptr), 0);
  const Ref<Quantity> unitless = quantity(5, Unit::unitFromString("parsec"));
  EXPECT_EQ(unitless->doubleValueForUnit(Unit::countUnit()), 0);
  EXPECT_FALSE(unitless->isEqual(*energy));
  EXPECT_TRUE(
      std::isnan(quantity(std::nan(""), Unit::meterUnit())->doubleValueForUnit(Unit::unitFromString("km"))));
}

TEST(UnitTest, IsReadFromItsTextAlone) {
  for (const char* text : {"", "/", "kcal/", "/min", "KCAL", "ml/kg/", "ml kg", "min "}) {
    EXPECT_EQ(Unit::unitFromString(text), nullptr) << text;
  }
  const Ref<Unit> oxygen = Unit::literUnitWithMetricPrefix(MetricPrefix::milli)
                               ->unitDividedByUnit(*Unit::gramUnitWithMetricPrefix(MetricPrefix::kilo))
                               ->unitDividedByUnit(*Unit::minuteUnit());
  EXPECT_EQ(oxygen->text(), "ml/kg/min");
  EXPECT_TRUE(oxygen->isEqual(*Unit::unitFromString("ml/kg/min")));
  EXPECT_TRUE(Unit::meterUnitWithMetricPrefix(MetricPrefix::kilo)->isEqual(*Unit::unitFromString("km")));
  EXPECT_TRUE(Unit::unitFromString("km/m")->isCompatibleWithUnit(*Unit::countUnit()));
}

TEST(UnitTest, AgreesWithItsNumber) {
  const struct {
    const char* locale;
    float value;
    const char* unit;
    const char* text;
  } cases[] = {{"en_US", 1.004f, "kcal", "1 kilocalorie"},
               {"en_US", 1.04f, "min", "1.04 minutes"},
               {"en_US", 12, "count", "12"},
               {"en_US", HUGE_VALF, "km", "no value"},
               {"de_DE", 1, "mi", "1 Meile"},
               {"de_DE", 1, "hr", "1 Stunde"},
               {"fr_FR", 0, "km", "0 kilomètre"},
               {"fr_FR", 1.5f, "km", "1,5 kilomètre"},
               {"es_ES", 1, "km", "1 kilómetro"},
               {"ja_JP", 144, "count/min", "毎分144拍"},
               {"ar_EG", 1, "m", "متر واحد"},
               {"ar_EG", 3, "km", "٣ كيلومترات"},
               {"ar_EG", 103, "cal", "١٠٣ سعرات حرارية"},
               {"ar_EG", 86, "m", "٨٦ مترًا"},
               {"ar_EG", -1, "m", "ناقص متر واحد"},
               {"ar_EG", 5, "count", "٥"}};
  for (const auto& c : cases) {
    const RegionScope language(c.locale);
    const Ref<Object> unit = make<Unit>(c.unit, 1, Unit::Dimension());
    EXPECT_EQ(stringWithFormat(string("{0, unit, 1}"), {formatFloat(FloatFormat::twoDecimals, c.value), unit})
                  ->text(),
              c.text);
  }
  const Ref<Unit> unnamed = make<Unit>("parsec", 1, Unit::Dimension());
  EXPECT_EQ(stringWithFormat(string("{0, unit, 1}"), {number(1), unnamed})->text(), "1 parsec");
  EXPECT_EQ(Unit::countUnit()->description(), "") << "what is counted has no name";
  EXPECT_EQ(Unit::unitFromString("km")->spokenName()->text(), "kilometers");
  EXPECT_EQ(quantity(1, Unit::unitFromString("mi"))->description(), "1 mile");
}

TEST(HealthStoreTest, AnswersOrFails) {
  const Ref<HealthStore> store = make<HealthStore>();
  Environment environment;
  environment.wheelchair = WheelchairUse::yes;
  setEnvironment(environment);
  Ref<Object> error;
  EXPECT_EQ(store->wheelchairUseWithError(error)->wheelchairUse(), 2);
  EXPECT_EQ(error, nullptr);
  environment.wheelchair = WheelchairUse::error;
  setEnvironment(environment);
  EXPECT_EQ(store->wheelchairUseWithError(error), nullptr);
  EXPECT_NE(error, nullptr);
  setEnvironment({});
}

TEST(ActivitySummaryTest, KnowsItsDay) {
  Environment environment;
  environment.timeZone = "America/New_York";
  setEnvironment(environment);
  const auto day = [](double time) {
    return cacheIndexFromDateComponents(
        activityCacheDateComponentsFromDate(date(time), Calendar::currentCalendar()));
  };
  EXPECT_EQ(day(0), -1) << "still the last day of 1969";
  EXPECT_EQ(day(5 * 3600.0), 0);
  EXPECT_EQ(day(1772945999), 20519) << "the second before the night on which the clocks change";
  EXPECT_EQ(day(1772946000), 20520);
  EXPECT_EQ(cacheIndexFromDateComponents(nullptr), 0);
  EXPECT_EQ(activityCacheDateComponentsFromDate(nullptr, Calendar::currentCalendar()), nullptr);
  setEnvironment({});
  const Ref<ActivitySummary> summary = make<ActivitySummary>();
  summary->setFractions(0.5, 1.25, 2);
  EXPECT_EQ(summary->safeDoubleForKey("_exerciseTimeCompletionPercentage"_key), 1.25);
}

}  // namespace

}  // namespace ax
