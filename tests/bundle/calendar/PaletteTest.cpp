#include <gtest/gtest.h>

#include <cmath>
#include <random>

#include "host/calendar/PaletteViewController.h"
#include "host/calendar/PaletteWeekdayHeaderView.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/GivenSummaries.h"
#include "tests/bundle/Members.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/platform/EnvironmentScope.h"

// The weekday header over many weeks, sizes and settings, each compared with a reckoning of the test's own.
namespace ax {

namespace {

constexpr std::int64_t day = 86400;
constexpr double now = 1773144000;  // noon of Tuesday, 10 March 2026, in UTC

constexpr const char* englishDays[] = {"Sunday",   "Monday", "Tuesday", "Wednesday",
                                       "Thursday", "Friday", "Saturday"};

const Message<void(Ref<Object>)> highlight{"highlightWeekdayLabelForDateAndSetDay:"};

class PaletteTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static Environment at(double time, int firstDay = 2) {
    return Environment{.locale = "en_US", .timeZone = "UTC", .now = time, .firstDayOfWeek = firstDay};
  }

  static Ref<host::PaletteWeekdayHeaderView> header(Rect frame = {0, 0, 350, 40}) {
    const auto made = make<host::PaletteWeekdayHeaderView>();
    made->setFrame(frame);
    messages::layoutSubviews(made);
    return made;
  }

  void giveMove(std::int64_t dayIndex, double move) { summaries_.give(dayIndex, move, 0, 0); }

  static std::string moveOf(int percent) {
    return "Calories burned, " + std::to_string(percent) + "%, Exercise minutes, 0%, Stand hours, 0%";
  }

  const EnvironmentScope environment_{at(now)};
  GivenSummaries summaries_;
};

TEST_F(PaletteTest, TellsTheWeekThatHoldsTheShownDate) {
  const auto shown = header();
  std::mt19937 random(19700104);
  for (int i = 0; i < 300; ++i) {
    // From the year 1900 to 2120, at any time of the day.
    const std::int64_t dayIndex = static_cast<std::int64_t>(random() % 80000) - 25567;
    const std::int64_t daysSinceMonday = ((dayIndex + 3) % 7 + 7) % 7;  // day 0 was a Thursday
    for (int column = 0; column < 7; ++column) giveMove(dayIndex - daysSinceMonday + column, 0.11 * column);
    highlight(shown, date(static_cast<double>(dayIndex * day) + static_cast<double>(random() % day)));
    const Ref<Array> labels = messages::accessibilityElements(shown);
    for (std::size_t column = 0; column < 7; ++column)
      ASSERT_EQ(valueOf(labels->at(column)), moveOf(static_cast<int>(11 * column))) << dayIndex;
    for (int column = 0; column < 7; ++column) GivenSummaries::take(dayIndex - daysSinceMonday + column);
  }
}

TEST_F(PaletteTest, NamesItsDaysFromTheFirstOfTheGoalsAndMarksToday) {
  for (int firstDay = 1; firstDay <= 7; ++firstDay) {
    for (int today = 0; today < 7; ++today) {
      const EnvironmentScope changed(at(now - 2 * day + today * day, firstDay));  // from Sunday, 8 March
      const Ref<Array> labels = messages::accessibilityElements(header());
      for (std::size_t column = 0; column < 7; ++column) {
        const std::size_t weekday = (column + static_cast<std::size_t>(firstDay) - 1) % 7;
        const std::string expected =
            (weekday == static_cast<std::size_t>(today) ? "Today, " : "") + std::string(englishDays[weekday]);
        ASSERT_EQ(labelOf(labels->at(column)), expected) << firstDay << ' ' << today;
      }
    }
  }
}

TEST_F(PaletteTest, FindsUnderAFingerTheDayWhoseFrameHoldsIt) {
  std::mt19937 random(7);
  for (int i = 0; i < 200; ++i) {
    const double width = 7 * (1 + random() % 100);
    const auto shown = header({static_cast<double>(random() % 50), 30, width, 40});
    const Ref<Array> labels = messages::accessibilityElements(shown);
    for (int k = 0; k < 20; ++k) {
      const Point finger{width * static_cast<double>(random() % 1000) / 1000, 20};
      const Ref<Object> found = messages::_accessibilityHitTest(shown, finger, nullptr);
      ASSERT_NE(found, nullptr) << finger.x << " of " << width;
      const Rect frame = messages::accessibilityFrame(found);
      const double onScreen = shown->frame().x + finger.x;
      ASSERT_GE(onScreen, frame.x - 1e-9);
      ASSERT_LE(onScreen, frame.maxX() + 1e-9);
    }
    EXPECT_EQ(messages::_accessibilityHitTest(shown, {0, 0}, nullptr), labels->at(0));
    EXPECT_EQ(messages::_accessibilityHitTest(shown, {width, 0}, nullptr), nullptr);
    EXPECT_EQ(messages::_accessibilityHitTest(shown, {std::nextafter(width, 0), 0}, nullptr), labels->at(6));
  }
}

TEST_F(PaletteTest, FillsItsValuesAnewOnlyAfterASetUp) {
  giveMove(20522, 0.25);  // 10 March
  const auto shown = header();
  const Ref<Object> tuesday = messages::accessibilityElements(shown)->at(1);
  EXPECT_EQ(valueOf(tuesday), moveOf(25));
  giveMove(20522, 0.5);
  messages::accessibilityElements(shown);
  EXPECT_EQ(valueOf(tuesday), moveOf(25));
  load(shown);
  EXPECT_EQ(valueOf(tuesday), "(none)") << "cleared, and filled at the next question";
  messages::accessibilityElements(shown);
  EXPECT_EQ(valueOf(tuesday), moveOf(50));
  messages::setAccessibilityValue(member<Array>(*shown, "_weekdayLabels")->at(5), nullptr);
  giveMove(20522, 0.75);
  messages::accessibilityElements(shown);
  EXPECT_EQ(valueOf(tuesday), moveOf(75)) << "one missing value renews all";
}

TEST_F(PaletteTest, KeepsItsDateWhenTheHostCannotShowAnother) {
  giveMove(20522, 0.25);
  const auto shown = header();
  highlight(shown, date(now - 7 * day));
  EXPECT_EQ(valueOf(messages::accessibilityElements(shown)->at(1)), "No data");
  ASSERT_TRUE(setScriptedAnswer(*shown, highlight.selector(),
                                [](auto) -> Ref<Object> { throw std::runtime_error("no such day"); }));
  EXPECT_THROW(highlight(shown, date(now)), std::runtime_error);
  load(shown);
  EXPECT_EQ(valueOf(messages::accessibilityElements(shown)->at(1)), "No data");
}

TEST_F(PaletteTest, TakesWhatIsNoDateForToday) {
  giveMove(20522, 0.25);
  const auto shown = header();
  highlight(shown, date(now - 70 * day));
  highlight(shown, string("yesterday"));
  EXPECT_EQ(valueOf(messages::accessibilityElements(shown)->at(1)), moveOf(25));
  highlight(shown, date(now - 70 * day));
  highlight(shown, nullptr);
  EXPECT_EQ(valueOf(messages::accessibilityElements(shown)->at(1)), moveOf(25));
}

TEST_F(PaletteTest, EndsWithItsDateButNotWithItsLabels) {
  auto shown = header();
  Ref<Object> date = ax::date(now);
  const Weak<Object> kept = date;
  highlight(shown, date);
  date = nullptr;
  EXPECT_TRUE(kept);
  const Ref<Object> monday = messages::accessibilityElements(shown)->at(0);
  EXPECT_EQ(messages::accessibilityContainer(monday), shown);
  shown = nullptr;
  EXPECT_FALSE(kept);
  EXPECT_EQ(messages::accessibilityContainer(monday), nullptr);
  EXPECT_EQ(labelOf(monday), "Monday");
}

TEST_F(PaletteTest, IsSetUpWhenItIsMadeIfItIsMade) {
  const Message<Ref<Object>(Ref<Object>)> init{"initWithNavigationPalette:"};
  const auto shown = make<host::PaletteWeekdayHeaderView>();
  EXPECT_EQ(init(shown, nullptr), shown);
  EXPECT_EQ(labelOf(member<Array>(*shown, "_weekdayLabels")->at(1)), "Today, Tuesday");
  const auto refused = make<host::PaletteWeekdayHeaderView>();
  ASSERT_TRUE(setScriptedAnswer(*refused, init.selector(), [](auto) { return Ref<Object>(); }));
  EXPECT_EQ(init(refused, nullptr), nullptr);
}

TEST_F(PaletteTest, AControllerListsTheHeaderThatItHasNow) {
  const auto controller = make<host::PaletteViewController>();
  messages::viewDidLoad(controller);
  ASSERT_NE(messages::accessibilityElements(controller->view()), nullptr);
  EXPECT_TRUE(messages::accessibilityElements(controller->view())->isEmpty());
  for (int i = 0; i < 2; ++i) {
    const auto shown = make<host::PaletteWeekdayHeaderView>();
    setMember(*controller, "_paletteView", shown);
    messages::viewDidLoad(controller);
    const Ref<Array> listed = messages::accessibilityElements(controller->view());
    ASSERT_NE(listed, nullptr);
    EXPECT_TRUE(listed->isEqual(*array({shown})));
  }
}

// The initials that the app draws belong to the same days as the names, wherever the reader lives.
TEST_F(PaletteTest, ShowsTheInitialsOfTheDaysThatItNames) {
  for (const char* zone : {"UTC", "Pacific/Auckland", "Pacific/Kiritimati", "Pacific/Tongatapu",
                           "Pacific/Pago_Pago", "Asia/Kolkata", "America/Los_Angeles"}) {
    for (int firstDay = 1; firstDay <= 7; ++firstDay) {
      const EnvironmentScope abroad(Environment{.timeZone = zone, .now = now, .firstDayOfWeek = firstDay});
      const Ref<Array> labels = messages::accessibilityElements(header());
      for (const Ref<Object>& label : *labels) {
        const std::string name = labelOf(label);
        const std::size_t start = name.starts_with("Today, ") ? 7 : 0;
        EXPECT_EQ(plain(cast<Label>(label)->text()), name.substr(start, 1)) << zone << ' ' << name;
      }
    }
  }
}

}  // namespace

}  // namespace ax
