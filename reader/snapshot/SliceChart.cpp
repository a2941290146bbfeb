#include "reader/snapshot/SliceChart.h"

#include "platform/formatting/CalendarMath.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/Date.h"
#include "platform/health/Unit.h"
#include "platform/runtime/KeyReading.h"
#include "platform/toolkit/AccessibilityMessages.h"
#include "platform/toolkit/ElementTree.h"
#include "platform/toolkit/TableViewCell.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

bool isCell(const Object& view) {
  return view.isKindOf(TableViewCell::staticClass()) || view.isKindOf(CollectionViewCell::staticClass());
}

View* cellOf(Object& chart) {
  View* view = cast<View>(&chart);
  while (view != nullptr && !isCell(*view)) view = view->superview();
  return view;
}

// The first text that the cell shows beside the chart.
Ref<Object> titleIn(View& cell, const Object& chart) {
  for (const Key key : {"_titleLabel"_key, "titleLabel"_key, "textLabel"_key}) {
    if (Ref<Object> label = cell.safeValueForKey(key)) return label;
  }
  Ref<Object> title;
  visitDescendants(cell, [&](Object& child) {
    if (title || &child == &chart) return false;
    if (cast<Label>(&child) != nullptr) title = Ref<Object>(&child);
    return !title;
  });
  return title;
}

std::string whatItIs(const Object& chart) {
  if (chart.isKindOf(Class::named("ActivityActiveHoursChart"))) return readerText("chart.of.active.hours");
  const Ref<Unit> unit = cast<Unit>(chart.safeValueForKey("_preferredUnit"_key));
  if (!unit) return {};
  const bool isTime = unit->isCompatibleWithUnit(*Unit::minuteUnit());
  return readerText(isTime ? "chart.of.minutes" : "chart.of.energy");
}

struct Beginning {
  std::string_view path;
  bool isDay;
};
constexpr Beginning beginnings[] = {{"dateInterval.startDate", false}, {"_barSeries._minDate", true}};

}  // namespace

std::optional<AttributedText> nameOfSliceChart(Object& chart, HostQuestions& questions) {
  if (View* cell = cellOf(chart)) {
    const auto title = questions.askText(messages::accessibilityLabel, titleIn(*cell, chart));
    if (title && !title->text.empty()) return title;
  }
  const std::string kind = whatItIs(chart);
  return kind.empty() ? std::nullopt : std::optional(AttributedText{kind});
}

SliceTimes::SliceTimes(const Object& chart) {
  for (const auto& [path, isDay] : beginnings) {
    const Ref<Date> date = cast<Date>(chart.safeValueForKeyPath(path));
    if (!date) continue;
    const double time = date->timeIntervalSince1970();
    start_ = isDay ? formatting::startOfDay(time) : time;
    isByClock_ = isDay;
    return;
  }
}

std::optional<double> SliceTimes::after(double seconds) const {
  if (!start_ || !isByClock_) return start_ ? std::optional(*start_ + seconds) : std::nullopt;
  const double passed = *start_ + seconds;
  return passed + formatting::daylightSavingOffset(*start_) - formatting::daylightSavingOffset(passed);
}

}  // namespace ax::reader
