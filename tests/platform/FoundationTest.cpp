#include <gtest/gtest.h>

#include <atomic>
#include <cmath>
#include <limits>
#include <memory>
#include <stdexcept>

#include "platform/formatting/Numbers.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/AttributedString.h"
#include "platform/foundation/BackgroundQueue.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/Environment.h"
#include "platform/foundation/Formatters.h"
#include "platform/foundation/WeatherUtilities.h"
#include "platform/runtime/Boxing.h"
#include "platform/runtime/Number.h"
#include "platform/runtime/Value.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "tests/formatting/RegionScope.h"

namespace ax {

namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr std::int64_t least = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t most = std::numeric_limits<std::int64_t>::max();

TEST(StringTest, SplitsAtEveryNewline) {
  const auto pieces = [](std::string text) {
    std::vector<std::string> result;
    for (const Ref<String>& piece : componentsSeparatedByNewlines(*string(text)))
      result.push_back(piece->text());
    return result;
  };
  using Pieces = std::vector<std::string>;
  EXPECT_EQ(pieces(""), Pieces{""});
  EXPECT_EQ(pieces("one"), Pieces{"one"});
  EXPECT_EQ(pieces("\none\n"), (Pieces{"", "one", ""}));
  EXPECT_EQ(pieces("a\r\nb"), (Pieces{"a", "", "b"})) << "between two newline characters stands nothing";
  EXPECT_EQ(pieces("a\u2028b\u2029c\u0085d"), (Pieces{"a", "b", "c", "d"}));
  EXPECT_EQ(pieces("\u2022 \u20AC"), Pieces{"\u2022 \u20AC"}) << "characters that share bytes with newlines";
}

TEST(StringTest, LosesEveryOccurrenceOfAPart) {
  EXPECT_EQ(stringByRemoving(string("a-b-c-"), "-")->text(), "abc");
  EXPECT_EQ(stringByRemoving(string("aab"), "ab")->text(), "a");
  const Ref<String> text = string("abc");
  EXPECT_EQ(stringByRemoving(text, "x"), text);
  EXPECT_EQ(stringByRemoving(nullptr, "x"), nullptr);
}

TEST(StringTest, CarriesASpokenForm) {
  const Ref<String> text = string("km");
  EXPECT_EQ(messages::accessibilityLabel(text), nullptr);
  messages::setAccessibilityLabel(text, string("kilometers"));
  EXPECT_EQ(messages::accessibilityLabel(text)->text(), "kilometers");
  EXPECT_TRUE(text->isEqual(*string("km")));
  const Ref<AttributedString> styled = make<AttributedString>(text);
  messages::setAccessibilityLabel(styled, string("per kilometer"));
  EXPECT_EQ(messages::accessibilityLabel(styled)->text(), "per kilometer");
}

TEST(AttributedTextTest, CutsRangesToTheText) {
  const Ref<AccessibilityAttributedString> text =
      AccessibilityAttributedString::initWithString(string("12:34"));
  text->setAttributeForKey(number(true), DurationTimeMMSS);
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {3, 100});
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {5, 1});
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {std::size_t(-1), std::size_t(-1)});
  text->setAttributeForKeyWithRange(number(true), DurationTimeHHMMSS, {2, 0});
  ASSERT_EQ(text->attributes().size(), 2u);
  EXPECT_EQ(text->attributes()[0].range, (TextRange{0, 5}));
  EXPECT_EQ(text->attributes()[1].range, (TextRange{3, 2}));
  EXPECT_TRUE(AccessibilityAttributedString::initWithString(nullptr)->isEmpty());
}

TEST(NumberTest, ConvertsToTheNearestThereIs) {
  const struct {
    Ref<Number> number;
    std::int32_t asInt;
    std::int64_t asInt64;
    std::uint64_t asUnsigned;
    bool asBool;
  } cases[] = {
      {number(-1.9), -1, -1, 0, true},
      {number(0.3f), 0, 0, 0, true},
      {number(std::nan("")), 0, 0, 0, true},
      {number(infinity), std::numeric_limits<std::int32_t>::max(), most, ~std::uint64_t(0), true},
      {number(-1e300), std::numeric_limits<std::int32_t>::min(), least, 0, true},
      {number(std::int64_t(1) << 40), std::numeric_limits<std::int32_t>::max(), std::int64_t(1) << 40,
       std::uint64_t(1) << 40, true},
      {number(least), std::numeric_limits<std::int32_t>::min(), least, 0, true},
      {number(~std::uint64_t(0)), std::numeric_limits<std::int32_t>::max(), most, ~std::uint64_t(0), true},
      {number(true), 1, 1, 1, true},
      {number(-0.0), 0, 0, 0, false}};
  for (const auto& c : cases) {
    EXPECT_EQ(c.number->intValue(), c.asInt) << c.number->description();
    EXPECT_EQ(c.number->int64Value(), c.asInt64) << c.number->description();
    EXPECT_EQ(c.number->unsignedValue(), c.asUnsigned) << c.number->description();
    EXPECT_EQ(c.number->boolValue(), c.asBool) << c.number->description();
  }
}

TEST(NumberTest, EqualsWhatCountsTheSame) {
  EXPECT_TRUE(number(1)->isEqual(*number(1.0)));
  EXPECT_TRUE(number(true)->isEqual(*number(1u)));
  EXPECT_FALSE(number(most)->isEqual(*number(most - 1))) << "two numbers that are one as doubles";
  EXPECT_FALSE(number(1)->isEqual(*string("1")));
  EXPECT_EQ(number(0.1)->description(), "0.1");
  EXPECT_EQ(number(0.1f)->description(), "0.1");
  EXPECT_EQ(number(false)->description(), "0");
}

TEST(BoxingTest, GivesBackWhatWentIn) {
  EXPECT_EQ(unbox<std::uint64_t>(box(~std::uint64_t(0))), ~std::uint64_t(0));
  EXPECT_EQ(unbox<std::int64_t>(box(least)), least);
  EXPECT_EQ(unbox<Insets>(box(Insets{1, 2, 3, 4})), (Insets{1, 2, 3, 4}));
  EXPECT_EQ(unbox<Size>(box(Point{1, 2})), Size()) << "a size is no point";
  EXPECT_EQ(unbox<const Class*>(box(&String::staticClass())), &String::staticClass());
  EXPECT_EQ(unbox<const Class*>(string("String")), nullptr);
  EXPECT_EQ(unbox<double>(nullptr), 0);
}

TEST(DateIntervalTest, HoldsBothItsEnds) {
  const Ref<DateInterval> interval = make<DateInterval>(date(3600), date(7200));
  const DateInterval& hour = *interval;
  EXPECT_TRUE(hour.containsDate(*date(3600)));
  EXPECT_TRUE(hour.containsDate(*date(7200)));
  EXPECT_FALSE(hour.containsDate(*date(3599.999)));
  EXPECT_FALSE(hour.containsDate(*date(7200.001)));
  EXPECT_FALSE(hour.containsDate(*date(std::nan(""))));
  EXPECT_EQ(hour.duration(), 3600);
  EXPECT_TRUE(hour.isEqual(*make<DateInterval>(date(3600), date(7200))));
}

TEST(PercentTextTest, IsTheFormattersOfEveryFraction) {
  for (const char* locale : {"en_US", "ar_EG", "fr_FR"}) {
    const RegionScope scope(locale);
    for (int round = 0; round < 2; ++round) {
      for (int i = -20; i < 2500; ++i) {
        const float fraction = static_cast<float>(i) / 1000;
        ASSERT_EQ(formatFloatWithPercentage(fraction)->text(), formatting::percentString(fraction)) << i;
      }
    }
    for (const double fraction : {infinity, -infinity, 1e300, -0.0, 0.00499999, 0.00500001}) {
      const auto rounded = static_cast<float>(fraction);
      EXPECT_EQ(formatFloatWithPercentage(rounded)->text(), formatting::percentString(rounded));
    }
  }
}

TEST(ArrayTest, LeavesOutNil) {
  const Ref<String> x = string("x");
  EXPECT_TRUE(array({nullptr, x, nullptr})->isEqual(*array({x})));
  EXPECT_EQ(make<MutableArray>(Array::Items{nullptr, x})->description(), "(x)");
  const Ref<Array> kept = axArrayByIgnoringNilElementsWithCount(3, {nullptr, x, nullptr});
  ASSERT_EQ(kept->count(), 1u);
  EXPECT_EQ(kept->firstObject(), x);
  EXPECT_EQ(axArrayByIgnoringNilElementsWithCount(1, {x, x})->count(), 1u);
  EXPECT_EQ(axArrayByIgnoringNilElementsWithCount(9, {x, x})->count(), 2u);
  EXPECT_TRUE(axArrayByIgnoringNilElementsWithCount(0, {})->isEmpty());
  const Ref<MutableArray> list = make<MutableArray>();
  list->axSafelyAddObject(nullptr);
  list->axSafelyAddObject(x);
  EXPECT_EQ(list->count(), 1u);
  EXPECT_EQ(list->at(1), nullptr);
  const Ref<Array> numbers = array({number(1), number(2), number(3)});
  const Ref<Array> odd = ax_filteredArrayUsingBlock(
      *numbers, [](Object& o) { return static_cast<Number&>(o).intValue() % 2 == 1; });
  EXPECT_TRUE(odd->isEqual(*array({number(1), number(3)})));
  EXPECT_FALSE(odd->isEqual(*numbers));
}

// Comes back to the queue as it ends, as captured objects may.
struct Returning {
  explicit Returning(std::atomic<int>& ended) : count(&ended) {}
  ~Returning() {
    dispatchInBackground([all = count] { ++*all; });
  }
  std::atomic<int>* count;
};

TEST(BackgroundQueueTest, EndsWhatATaskCapturedOutsideItsLock) {
  std::atomic<int> ended = 0;
  auto captured = std::make_shared<Returning>(ended);
  dispatchInBackground([kept = std::move(captured)] {});
  waitForBackgroundTasks();
  EXPECT_EQ(ended, 1);
}

TEST(BackgroundQueueTest, OutlivesTasksThatRaise) {
  const std::size_t before = failedBackgroundTasks();
  std::atomic<int> done = 0;
  testing::internal::CaptureStderr();
  dispatchInBackground([] { throw std::runtime_error("no store"); });
  dispatchInBackground([] { throw 7; });
  for (int i = 0; i < 8; ++i) dispatchInBackground([&done] { ++done; });
  waitForBackgroundTasks();
  const std::string told = testing::internal::GetCapturedStderr();
  EXPECT_EQ(failedBackgroundTasks(), before + 2);
  EXPECT_EQ(done, 8);
  EXPECT_NE(told.find("a background task raised: no store\n"), std::string::npos) << told;
}

// Worked out while compiling, where leaving the range of a type is an error.
static_assert(conditionCodeFromLegacyWeatherConditionCode(std::numeric_limits<std::int64_t>::min()) == -1);
static_assert(conditionCodeFromLegacyWeatherConditionCode(std::numeric_limits<std::int64_t>::max()) == -1);
static_assert(conditionCodeFromLegacyWeatherConditionCode(0) == -1);
static_assert(conditionCodeFromLegacyWeatherConditionCode(48) == 47);

}  // namespace

}  // namespace ax
