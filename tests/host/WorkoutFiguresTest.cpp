#include "host/workouts/WorkoutFigures.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "host/workouts/CHWorkoutDataCalculator.h"
#include "host/workouts/WorkoutTotals.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/bundle/workouts/SomeWorkout.h"
#include "tests/formatting/RegionScope.h"
#include "tests/platform/EnvironmentScope.h"

// How the app shows and sums up workouts.
namespace ax::host {

namespace {

Ref<Quantity> amount(double value, const char* unit) {
  return quantity(value, Unit::unitFromString(unit));
}
std::string shown(const Ref<Quantity>& quantity) {
  return plainSpaces(figureOf(quantity)->description());
}
std::string spoken(const Ref<Quantity>& quantity) {
  return plainSpaces(labelOf(figureOf(quantity)));
}

class WorkoutFiguresTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{Environment{.locale = "en_US"}};
};

TEST_F(WorkoutFiguresTest, ShowAClockThatCarries) {
  const std::pair<double, const char*> clocks[] = {
      {0, "0:00"},           {59.4, "0:59"},      {59.5, "1:00"},
      {3599.4, "59:59"},     {3599.5, "1:00:00"}, {86399.9, "24:00:00"},
      {360000, "100:00:00"}, {-5, "0:00"},        {std::nan(""), "0:00"},
      {HUGE_VAL, "0:00"},    {-HUGE_VAL, "0:00"}, {1e18, "277777:46:40"}};
  for (const auto& [seconds, text] : clocks) EXPECT_EQ(clockText(seconds), text) << seconds;
}

TEST_F(WorkoutFiguresTest, ShowAPaceThatCarries) {
  const Ref<Unit> kilometer = Unit::unitFromString("km");
  const std::pair<double, const char*> paces[] = {
      {330, "5'30\" /km"}, {59.5, "1'00\" /km"}, {0.4, "0'00\" /km"},      {359.6, "6'00\" /km"},
      {0, "--'--\" /km"},  {-1, "--'--\" /km"},  {HUGE_VAL, "--'--\" /km"}};
  for (const auto& [seconds, text] : paces)
    EXPECT_EQ(paceFigure(seconds, *kilometer)->description(), text) << seconds;
  EXPECT_EQ(labelOf(paceFigure(330, *Unit::unitFromString("mi"))), "5'30\" per mile");
  EXPECT_EQ(spokenPace(330, *kilometer)->text(), "5 minutes, 30 seconds per kilometer");
}

TEST_F(WorkoutFiguresTest, ShowAShortUnitAndSpeakALongOne) {
  EXPECT_EQ(shown(amount(5.014, "km")), "5.01 km");
  EXPECT_EQ(spoken(amount(5.014, "km")), "5.01 kilometers");
  EXPECT_EQ(spoken(amount(1.004, "km")), "1 kilometer") << "what is shown as one is spoken as one";
  EXPECT_EQ(spoken(amount(0.996, "mi")), "1 mile");
  EXPECT_EQ(spoken(amount(1.4, "kcal")), "1 kilocalorie");
  EXPECT_EQ(shown(amount(12345.6, "m")), "12,346 m");
  EXPECT_EQ(shown(amount(3, "count")), amount(3, "count")->description()) << "a unit without a short form";
  EXPECT_EQ(shown(nullptr), "--");
  EXPECT_EQ(plainText(nullptr), nullptr);
  EXPECT_EQ(distanceInWords(amount(1.61, "km"))->text(), "1.61 kilometers");
  EXPECT_EQ(distanceInWords(nullptr), nullptr);
}

TEST_F(WorkoutFiguresTest, FollowTheLanguage) {
  const struct {
    const char* locale;
    const char* shown;
    const char* spoken;
  } languages[] = {{"de_DE", "1.234,5 km", "1.234,5 Kilometer"},
                   {"fr_FR", "1 234,5 km", "1 234,5 kilomètres"},
                   {"es_ES", "1234,5 km", "1234,5 kilómetros"},
                   {"ja_JP", "1,234.5km", "1,234.5キロメートル"}};
  for (const auto& [locale, text, words] : languages) {
    const EnvironmentScope language(Environment{.locale = locale});
    EXPECT_EQ(shown(amount(1234.5, "km")), text);
    EXPECT_EQ(spoken(amount(1234.5, "km")), words);
  }
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language(Environment{.locale = locale});
    for (const char* unit : {"kcal", "kJ", "km", "mi", "m", "yd", "ft", "km/hr", "mi/hr", "count/min"}) {
      const std::string text = shown(amount(7, unit));
      EXPECT_EQ(text.back() == ' ', false) << locale << ' ' << unit << ": the unit has a text";
      EXPECT_NE(spoken(amount(7, unit)), "(none)") << locale << ' ' << unit;
    }
  }
}

TEST_F(WorkoutFiguresTest, ShowEnergyInTheUnitOfTheUser) {
  const EnvironmentScope kilojoules(Environment{.energyUnit = "kJ"});
  EXPECT_EQ(shown(amount(100, "kcal")), "418 kJ");
  EXPECT_EQ(shown(amount(5, "km")), "5 km");
  const EnvironmentScope nonsense(Environment{.energyUnit = "furlong"});
  EXPECT_EQ(shown(amount(100, "kcal")), "100 kcal");
}

TEST_F(WorkoutFiguresTest, StandAQuantityWithoutAUnit) {
  const Ref<Quantity> bare = quantity(5, nullptr);
  EXPECT_EQ(figureOf(bare)->description(), bare->description());
  EXPECT_EQ(distanceInWords(bare), nullptr);
}

TEST_F(WorkoutFiguresTest, ReckonThePaceInTheUnitOfTheDistance) {
  const auto calculator = make<CHWorkoutDataCalculator>();
  EXPECT_DOUBLE_EQ(calculator->paceForWorkout(SomeWorkout{.seconds = 1650, .distance = 5}.made()), 330);
  EXPECT_DOUBLE_EQ(
      calculator->paceForWorkout(SomeWorkout{.seconds = 1500, .distance = 3, .unit = "mi"}.made()), 500);
  EXPECT_DOUBLE_EQ(
      calculator->paceForWorkout(SomeWorkout{.seconds = 60, .distance = 200, .unit = "m"}.made()), 300);
  EXPECT_EQ(calculator->paceForWorkout(SomeWorkout{}.made()), 0);
  EXPECT_EQ(calculator->paceForWorkout(nullptr), 0);
  const Ref<Quantity> speed =
      calculator->speedForWorkout(SomeWorkout{.seconds = 5400, .distance = 36}.made());
  EXPECT_EQ(speed->unit()->text(), "km/hr");
  EXPECT_DOUBLE_EQ(speed->value(), 24);
  EXPECT_EQ(calculator->speedForWorkout(SomeWorkout{.seconds = 0, .distance = 36}.made()), nullptr);
}

TEST_F(WorkoutFiguresTest, AddUpInTheUnitOfTheFirst) {
  const WorkoutTotals totals(array(
      {SomeWorkout{.seconds = 600}.made(), string("no workout"),
       SomeWorkout{.seconds = 1000, .distance = 2, .unit = "mi"}.made(),
       SomeWorkout{.seconds = 2000, .distance = 1.609344}.made(),
       SomeWorkout{.sport = "cycling", .seconds = 3000, .distance = 10, .unit = "mi", .kilocalories = 400}
           .made()}));
  EXPECT_EQ(totals.count, 4u);
  EXPECT_EQ(totals.seconds, 6600);
  EXPECT_EQ(totals.distance.total->unit()->text(), "mi");
  EXPECT_NEAR(totals.distance.total->value(), 13, 1e-9);
  EXPECT_EQ(totals.distance.count, 3u);
  EXPECT_EQ(totals.energy.count, 1u);
  EXPECT_EQ(totals.pacedDistance.total, nullptr) << "a run and a ride have no pace in common";
  const WorkoutTotals runs(array({SomeWorkout{.seconds = 600}.made(),
                                  SomeWorkout{.seconds = 1000, .distance = 2, .unit = "mi"}.made(),
                                  SomeWorkout{.seconds = 2000, .distance = 1.609344}.made()}));
  EXPECT_EQ(runs.pacedSeconds, 3000) << "without the one that has no distance";
  EXPECT_NEAR(runs.pacedDistance.total->value(), 3, 1e-9);
  const WorkoutTotals none(nullptr);
  EXPECT_EQ(none.count, 0u);
  EXPECT_EQ(none.distance.total, nullptr);
}

TEST_F(WorkoutFiguresTest, AverageOnlySeveral) {
  const auto container = make<CHWorkoutSummaryTabbedLabelContainer>();
  const auto text = [&](const char* name) {
    const Ref<String> held = member<String>(*container, name);
    return held ? plainSpaces(held->text()) : "(none)";
  };
  WorkoutTotals::Sum sum;
  sum.add(amount(5, "km"));
  showFigure(*container, "figure.distance", sum);
  EXPECT_EQ(text("_totalText"), "5 km");
  EXPECT_EQ(text("_averageText"), "(none)");
  sum.add(amount(2000, "m"));
  showFigure(*container, "figure.distance", sum);
  EXPECT_EQ(text("_totalText"), "7 km");
  EXPECT_EQ(text("_averageText"), "3.5 km");
  showFigure(*container, "figure.distance", {});
  EXPECT_TRUE(container->isHidden());
  EXPECT_EQ(text("_titleText"), "(none)") << "nothing of the former figures is left";
  showDuration(*container, 7384, 2);
  EXPECT_FALSE(container->isHidden());
  EXPECT_EQ(text("_totalText"), "2:03:04");
  EXPECT_EQ(text("_averageText"), "1:01:32");
}

}  // namespace

}  // namespace ax::host
