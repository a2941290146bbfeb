#include "bench/BundleSides.h"
#include "bench/HostObjects.h"
#include "bench/IcuFormats.h"
#include "bench/Sides.h"
#include "host/calendar/MonthWeekView.h"
#include "host/calendar/QSCalendarDayCell.h"
#include "host/core/ActivitySummaryCache.h"
#include "platform/formatting/FormatterStatistics.h"
#include "platform/toolkit/AccessibilityMessages.h"

// The weeks of a month asked for their days, each day for its label and its value.
namespace bench {

namespace {

using namespace ax;

constexpr double exercise = 0.5;
constexpr double stand = 0.75;

double timeOfDay(int day) {
  return benchNow - (day + 1) * benchDay;
}
double moveOfDay(int day) {
  return 0.01 * (day % 90);
}

using Weeks = std::vector<Ref<View>>;

Ref<Layer> dayCell(int day) {
  const auto cell = make<host::MonthDayCellLayer>();
  cell->setDate(date(timeOfDay(day)));
  cell->setFrame({50.0 * (day % 7), 0, 30, 30});
  const auto summary = make<ActivitySummary>();
  summary->setFractions(moveOfDay(day), exercise, stand);
  host::ActivitySummaryCache::sharedInstance()->setSummaryForCacheIndex(
      summary, static_cast<std::int64_t>(timeOfDay(day) / benchDay));
  return cell;
}

Weeks weeksOf(int days) {
  Weeks weeks;
  for (int day = 0; day < days; ++day) {
    if (day % 7 == 0) {
      weeks.push_back(make<host::MonthWeekView>());
      weeks.back()->setFrame({0, 100.0 * day / 7, 350, 100});
    }
    weeks.back()->layer()->addSublayer(dayCell(day));
  }
  return weeks;
}

std::size_t speak(const Weeks& weeks) {
  std::size_t bytes = 0;
  for (const Ref<View>& week : weeks) {
    const Ref<Array> elements = messages::accessibilityElements(week);
    for (const Ref<Object>& day : *elements) {
      bytes += messages::accessibilityLabel(day)->text().size();
      bytes += messages::accessibilityValue(day)->text().size();
    }
  }
  return bytes;
}

struct MonthTexts {
  IcuDates dates{"dMMMM"};
  IcuNumbers percent = IcuNumbers::percent();

  std::size_t write(int days) const {
    std::size_t bytes = 0;
    for (int day = 0; day < days; ++day) {
      bytes += dates.text(timeOfDay(day)).size();
      for (double fraction : {moveOfDay(day), exercise, stand}) bytes += percent.text(fraction).size();
    }
    return bytes;
  }
};

}  // namespace

void addMonthSides() {
  for (int days : monthSizes) {
    const std::string name = sized("month ", days);
    RegisteredSide(
        name, "ours",
        [=] {
          const Weeks weeks = weeksOf(days);
          check(speak(weeks) > 0, "a month says nothing");
          return [weeks] { benchmark::DoNotOptimize(speak(weeks)); };
        },
        days);
    RegisteredSide(
        name, "floor",
        [=] {
          return [texts = std::make_shared<MonthTexts>(), days] {
            benchmark::DoNotOptimize(texts->write(days));
          };
        },
        days);
  }
}

double formattersMadeByWarmMonth() {
  const Weeks weeks = weeksOf(monthSizes[0]);
  speak(weeks);
  const std::uint64_t before = formatting::formattersMade();
  speak(weeks);
  return static_cast<double>(formatting::formattersMade() - before);
}

}  // namespace bench
