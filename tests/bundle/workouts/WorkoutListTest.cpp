#include <gtest/gtest.h>

#include <array>

#include "host/workouts/CHWorkoutFormattingManager.h"
#include "host/workouts/CHWorkoutListTableHeaderView.h"
#include "host/workouts/CHWorkoutsListSummaryTableViewCell.h"
#include "host/workouts/CHWorkoutsListTableViewCell.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/bundle/workouts/SomeWorkout.h"
#include "tests/platform/EnvironmentScope.h"

// What scenes cannot show of the workout list: rows that are used again, hosts that raise, and every
// combination of totals.
namespace ax {

namespace {

constexpr double start = 1772884800;  // 12:00 on Saturday, 7 March 2026, in UTC

class WorkoutListTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "UTC", .now = start}};
};

class WorkoutRowTest : public WorkoutListTest {
 protected:
  std::string dateLabel() { return labelOf(row_->safeValueForKey("_dateLabel"_key)); }

  const Ref<host::CHWorkoutsListTableViewCell> row_ = make<host::CHWorkoutsListTableViewCell>();
};

TEST_F(WorkoutRowTest, IsUsedAgainForWorkoutsOfOtherMakers) {
  row_->setWorkout(SomeWorkout{.start = start, .source = "Trail Log"}.made());
  const Ref<ImageView> icon = row_->imageView();
  EXPECT_EQ(labelOf(icon), "Trail Log");
  EXPECT_EQ(dateLabel(), "Saturday, March 7, 2026");

  row_->setWorkout(SomeWorkout{.start = start + 86400, .source = "Watch", .isWatch = true}.made());
  EXPECT_EQ(row_->imageView(), icon);
  EXPECT_EQ(icon->image(), nullptr);
  EXPECT_EQ(labelOf(icon), "Trail Log") << "the icon is only ever named, never silenced";
  EXPECT_EQ(dateLabel(), "Sunday, March 8, 2026");

  row_->setWorkout(SomeWorkout{.start = start, .source = ""}.made());
  EXPECT_EQ(labelOf(icon), "Trail Log");
  row_->setWorkout(SomeWorkout{.start = start, .source = "Pool Days"}.made());
  EXPECT_EQ(labelOf(icon), "Pool Days");
}

TEST_F(WorkoutRowTest, HasNoNameOfTheWatch) {
  row_->setWorkout(SomeWorkout{.start = start, .source = "Watch", .isWatch = true}.made());
  EXPECT_EQ(labelOf(row_->imageView()), "(none)");
  EXPECT_FALSE(messages::isAccessibilityElement(row_->imageView()));
  EXPECT_EQ(labelOf(row_).find("Watch"), std::string::npos);
}

TEST_F(WorkoutRowTest, KeepsTheDateOfItsLastWorkoutThatHadOne) {
  row_->setWorkout(SomeWorkout{.start = start}.made());
  row_->setWorkout(SomeWorkout{}.made());
  EXPECT_EQ(dateLabel(), "Saturday, March 7, 2026");
  row_->setWorkout(nullptr);
  EXPECT_EQ(dateLabel(), "Saturday, March 7, 2026");
}

TEST_F(WorkoutRowTest, SpeaksItsDateInTheLanguageAndZoneOfItsSetUp) {
  row_->setWorkout(SomeWorkout{.start = start}.made());
  const EnvironmentScope german(
      Environment{.locale = "de_DE", .timeZone = "Pacific/Kiritimati", .now = start});
  EXPECT_EQ(dateLabel(), "Saturday, March 7, 2026");
  load(row_);
  EXPECT_EQ(dateLabel(), "Sonntag, 8. März 2026");
}

TEST_F(WorkoutRowTest, IsLeftAloneWhenTheHostRaises) {
  row_->setWorkout(SomeWorkout{.start = start}.made());
  setMember(*row_, "_workout", SomeWorkout{.start = start + 86400}.made());
  const Message<void()> configure{"_configureWithCurrentWorkout"};
  ASSERT_TRUE(setScriptedAnswer(*row_, configure.selector(),
                                [](auto) -> Ref<Object> { throw std::runtime_error("no workout"); }));
  EXPECT_THROW(configure(row_), std::runtime_error);
  EXPECT_EQ(dateLabel(), "Saturday, March 7, 2026");
}

class DurationTest : public WorkoutListTest {
 protected:
  const Message<Ref<Object>(Ref<Object>, Ref<Object>)> format_{"formattedDurationForWorkout:context:"};
  const Ref<host::CHWorkoutFormattingManager> manager_ = make<host::CHWorkoutFormattingManager>();
};

TEST_F(DurationTest, IsMarkedAsAWhole) {
  const Ref<Object> formatted = format_(manager_, SomeWorkout{.seconds = 5025}.made(), nullptr);
  ASSERT_NE(cast<AttributedString>(formatted), nullptr);
  const auto spoken =
      cast<AccessibilityAttributedString>(Ref<Object>(messages::accessibilityLabel(formatted)));
  ASSERT_NE(spoken, nullptr);
  EXPECT_EQ(spoken->text(), "1:23:45");
  ASSERT_EQ(spoken->attributes().size(), 1u);
  EXPECT_EQ(spoken->attributes()[0].key, DurationTimeHHMMSS);
  EXPECT_EQ(spoken->attributes()[0].range, (TextRange{0, 7}));
  EXPECT_TRUE(cast<Number>(spoken->attributes()[0].value)->boolValue());
}

TEST_F(DurationTest, IsTheHostsOwnObjectWhateverThatIs) {
  EXPECT_EQ(format_(manager_, nullptr, nullptr), nullptr);
  const Ref<Object> answers[] = {make<AttributedString>(string("")), make<AttributedString>(),
                                 string("12:34"), number(754), make<AttributedString>(string("12:34"))};
  for (const Ref<Object>& answer : answers) {
    ASSERT_TRUE(setScriptedAnswer(*manager_, format_.selector(), [answer](auto) { return answer; }));
    EXPECT_EQ(format_(manager_, SomeWorkout{}.made(), string("list")), answer);
    const bool isShown = answer == answers[4];
    EXPECT_EQ(labelOf(answer), isShown ? "12:34" : "(none)") << answer->description();
  }
}

TEST_F(DurationTest, ReplacesTheSpokenFormOfATextThatIsUsedAgain) {
  const auto text = make<AttributedString>(string("12:34"));
  ASSERT_TRUE(setScriptedAnswer(*manager_, format_.selector(), [text](auto) { return Ref<Object>(text); }));
  format_(manager_, nullptr, nullptr);
  text->setString(string("56:07"));
  format_(manager_, nullptr, nullptr);
  EXPECT_EQ(labelOf(text), "56:07");
}

TEST_F(WorkoutListTest, TheHeaderFollowsWhatItShows) {
  const auto header = make<host::CHWorkoutListTableHeaderView>();
  EXPECT_EQ(labelOf(header), "");
  header->setMonth(date(start));
  EXPECT_EQ(labelOf(header), "March 2026");
  header->setNumberOfWorkouts(1);
  EXPECT_EQ(labelOf(header), "March 2026, 1 workout");
  const EnvironmentScope japanese(Environment{.locale = "ja_JP", .now = start});
  EXPECT_EQ(labelOf(header), "March 2026、1 workout") << "the app's texts stay, the separator follows";
  header->setMonth(nullptr);
  EXPECT_EQ(labelOf(header), "1 workout");
}

// Every field may be missing, hidden, transparent or shown, each for itself.
TEST_F(WorkoutListTest, TheSummaryListsWhatShowsInTheSpokenOrder) {
  const std::array fields = {"_numberOfWorkoutsLabel", "_durationLabel", "_activeEnergyLabel",
                             "_distanceLabel", "_paceLabel"};
  for (int state = 0; state < 1024; ++state) {
    const auto cell = make<host::CHWorkoutsListSummaryTableViewCell>();
    Array::Items expected;
    for (int i = 0; i < 5; ++i) {
      const int kind = state >> (2 * i) & 3;
      const auto field = make<host::CHWorkoutSummaryTabbedLabelContainer>();
      if (kind != 0) setMember(*cell, fields[static_cast<std::size_t>(i)], field);
      if (kind == 1) field->setHidden(true);
      if (kind == 2) field->setAlpha(0);
      if (kind == 3) expected.push_back(field);
    }
    const Ref<Array> listed = messages::accessibilityElements(cell);
    ASSERT_TRUE(listed->isEqual(*array(expected))) << state;
  }
}

TEST_F(WorkoutListTest, TheSummaryIsSilentInAHiddenRow) {
  const auto cell = make<host::CHWorkoutsListSummaryTableViewCell>();
  cell->setWorkouts(array({SomeWorkout{.distance = 5, .kilocalories = 300}.made()}));
  ASSERT_EQ(messages::accessibilityElements(cell)->count(), 5u);
  const auto table = make<View>();
  table->addSubview(cell);
  table->setHidden(true);
  EXPECT_TRUE(messages::accessibilityElements(cell)->isEmpty());
  table->setHidden(false);
  EXPECT_EQ(messages::accessibilityElements(cell)->count(), 5u);
}

}  // namespace

}  // namespace ax
