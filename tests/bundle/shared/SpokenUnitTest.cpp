#include <gtest/gtest.h>

#include "platform/foundation/AttributedString.h"
#include "platform/health/Unit.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Message.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "tests/bundle/StartedBundle.h"

namespace ax {

namespace {

const Message<Ref<Object>(Ref<Object>, Ref<String>)> attrStringWithValueUnit{"attrStringWithValue:unit:"};

Ref<String> unitSpokenAs(const std::string& unit, const Ref<String>& spoken) {
  const Ref<String> result = string(unit);
  messages::setAccessibilityLabel(result, spoken);
  return result;
}

// Counts how often it is written.
class Figure : public Object {
 public:
  static Class& staticClass() {
    static Class& result = ClassBuilder<Figure>("SpokenUnitTest.Figure", Object::staticClass()).build();
    return result;
  }
  std::string description() const override {
    ++written;
    return "1";
  }
  mutable int written = 0;
};

class SpokenUnitTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static std::string labelWith(const Ref<String>& unit) {
    const Ref<Object> styled = attrStringWithValueUnit(String::staticClass(), string("3.5"), unit);
    EXPECT_NE(styled, nullptr);
    const Ref<String> label = messages::accessibilityLabel(styled);
    return styled->description() + " | " + (label ? label->text() : "(nil)");
  }
};

TEST_F(SpokenUnitTest, FiguresAreSpokenWithTheSpokenFormOfTheirUnit) {
  EXPECT_EQ(labelWith(unitSpokenAs("km", string("kilometers"))), "3.5 km | 3.5 kilometers");
  EXPECT_EQ(labelWith(unitSpokenAs("km", emptyString())), "3.5 km | 3.5") << "an empty form is one";
  EXPECT_EQ(labelWith(string("km")), "3.5 km | (nil)");
  EXPECT_EQ(labelWith(nullptr), "3.5 | (nil)");
}

TEST_F(SpokenUnitTest, TheHostIsAskedASecondTimeOnlyForASpokenUnit) {
  const Ref<Figure> figure = make<Figure>();
  attrStringWithValueUnit(String::staticClass(), figure, string("km"));
  EXPECT_EQ(figure->written, 1);
  attrStringWithValueUnit(String::staticClass(), figure, unitSpokenAs("km", string("kilometers")));
  EXPECT_EQ(figure->written, 3);
}

TEST_F(SpokenUnitTest, TrendsHaveTheUnitsOfTheirTypes) {
  const auto unitOfTrend = exported<Ref<Unit>(std::uint64_t)>("accessibilityQSUnitForTrendType");
  const std::string units[] = {"kcal", "min", "count", "m", "count", "count", "ml/kg/min", "km/hr", "km/hr"};
  std::uint64_t type = 0;
  for (const std::string& unit : units) {
    const Ref<Unit> found = unitOfTrend(type++);
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(found->text(), unit);
    EXPECT_TRUE(found->isCompatibleWithUnit(*Unit::unitFromString(unit)));
  }
  EXPECT_EQ(unitOfTrend(9), nullptr);
  EXPECT_EQ(unitOfTrend(UINT64_MAX), nullptr);
  EXPECT_NE(unitOfTrend(2), unitOfTrend(2)) << "made anew";
}

}  // namespace

}  // namespace ax
