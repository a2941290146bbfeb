#include <gtest/gtest.h>

#include <cmath>

#include "host/daydetail/ChartDetailCell.h"
#include "platform/foundation/Formatters.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// The spoken figures of the move and exercise rings, in every language and around every step of rounding.
namespace ax {

namespace {

const Message<void(Ref<Object>, Ref<Object>, double)> setActiveEnergy{"setActiveEnergy:goalEnergy:percent:"};
const Message<void(Ref<Object>, Ref<Object>, double)> setBriskMinutes{"setBriskMinutes:goal:percent:"};

class FigureLinesTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  template <class Cell, class Setter>
  std::string lineOf(const Setter& set, const Ref<Object>& amount, const Ref<Object>& goal) {
    const auto cell = make<Cell>();
    set(cell, amount, goal, std::nan(""));
    return labelOf(cell->safeValueForKey("_value"_key));
  }
  std::string moveLine(const Ref<Object>& amount, const Ref<Object>& goal) {
    return lineOf<host::MoveChartDetailCell>(setActiveEnergy, amount, goal);
  }
  std::string exerciseLine(const Ref<Object>& amount, const Ref<Object>& goal) {
    return lineOf<host::ExerciseChartDetailCell>(setBriskMinutes, amount, goal);
  }

  static bool holdsBoth(const std::string& line, std::int64_t amount, std::int64_t goal) {
    const std::string first = formatInteger(amount)->text();
    const std::string second = formatInteger(goal)->text();
    return line.find(first) != std::string::npos && line.find(second) != std::string::npos;
  }
};

TEST_F(FigureLinesTest, MoveIsRoundedDownInEveryLanguage) {
  const std::pair<double, int> amounts[] = {{0, 0},       {0.999, 0},     {1, 1},           {349.5, 349},
                                            {349.9, 349}, {1999.9, 1999}, {12345.99, 12345}};
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language{Environment{.locale = locale}};
    for (const auto& [amount, spoken] : amounts) {
      const std::string line =
          moveLine(quantity(amount, Unit::kilocalorieUnit()), quantity(7777.9, Unit::kilocalorieUnit()));
      EXPECT_TRUE(holdsBoth(line, spoken, 7777)) << locale << ' ' << amount << ": " << line;
      EXPECT_EQ(line.find("kcal"), std::string::npos) << line;
    }
  }
}

TEST_F(FigureLinesTest, ExerciseIsRoundedToTheNearestInEveryLanguage) {
  const std::pair<double, int> amounts[] = {{0.49, 0},  {0.5, 1},   {1.5, 2},       {2.5, 3},
                                            {29.4, 29}, {29.5, 30}, {1439.5, 1440}, {0.49999999999999994, 0}};
  for (const char* locale : localesOfAllLanguages) {
    const EnvironmentScope language{Environment{.locale = locale}};
    for (const auto& [amount, spoken] : amounts) {
      const std::string line =
          exerciseLine(quantity(amount, Unit::minuteUnit()), quantity(4620, Unit::unitFromString("s")));
      EXPECT_TRUE(holdsBoth(line, spoken, 77)) << locale << ' ' << amount << ": " << line;
    }
  }
}

TEST_F(FigureLinesTest, SpeakOfNothingWithoutQuantities) {
  const EnvironmentScope language{Environment{}};
  EXPECT_EQ(moveLine(nullptr, nullptr), "0 of 0 calories");
  EXPECT_EQ(exerciseLine(nullptr, nullptr), "0 of 0 minutes");
  EXPECT_EQ(moveLine(string("349"), quantity(500, Unit::kilocalorieUnit())), "0 of 500 calories");
  EXPECT_EQ(exerciseLine(string("29"), make<Object>()), "0 of 0 minutes");
}

TEST_F(FigureLinesTest, SurviveAmountsThatAreNoFigures) {
  const EnvironmentScope language{Environment{}};
  for (const double amount : {std::nan(""), HUGE_VAL, -HUGE_VAL, 1e300, -1e300}) {
    const Ref<Quantity> goal = quantity(500, Unit::kilocalorieUnit());
    EXPECT_EQ(moveLine(quantity(amount, Unit::kilocalorieUnit()), goal), "no value");
    EXPECT_EQ(moveLine(goal, quantity(amount, Unit::kilocalorieUnit())), "no value");
    const std::string minutes =
        exerciseLine(quantity(amount, Unit::minuteUnit()), quantity(30, Unit::minuteUnit()));
    EXPECT_TRUE(std::isfinite(amount) ? minutes.ends_with(" of 30 minutes") : minutes == "no value")
        << minutes;
  }
}

// The label is that of the last call, on whichever label then shows the figure.
TEST_F(FigureLinesTest, FollowTheLabelThatShowsTheFigure) {
  const EnvironmentScope language{Environment{}};
  const auto cell = make<host::ExerciseChartDetailCell>();
  const auto first = make<Label>();
  const auto second = make<Label>();
  const InstanceVariable* value = cell->isa().instanceVariable("_value"_key);
  EXPECT_TRUE(value->write(*cell, first));
  setBriskMinutes(cell, quantity(10, Unit::minuteUnit()), quantity(30, Unit::minuteUnit()), 0);
  EXPECT_TRUE(value->write(*cell, second));
  setBriskMinutes(cell, quantity(20, Unit::minuteUnit()), quantity(30, Unit::minuteUnit()), 0);
  EXPECT_EQ(labelOf(first), "10 of 30 minutes");
  EXPECT_EQ(labelOf(second), "20 of 30 minutes");
}

}  // namespace

}  // namespace ax
