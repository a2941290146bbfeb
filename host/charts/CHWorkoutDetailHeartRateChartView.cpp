#include "host/charts/CHWorkoutDetailHeartRateChartView.h"

#include <cmath>
#include <map>

#include "host/charts/HeartRateUnits.h"
#include "host/charts/VLUIChartPointMultiple.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Message.h"

namespace ax::host {

namespace {

constexpr int columnsOfWorkout = 60;
constexpr std::size_t fewestPoints = 2;

const Message<Ref<DateInterval>()> askDateInterval{"_dateInterval"};

struct Span {
  double lowest;
  double highest;

  void add(double rate) {
    lowest = std::min(lowest, rate);
    highest = std::max(highest, rate);
  }
};

using Columns = std::map<int, Span>;

// The readings outside the workout go into the column at the end that they are nearer.
int columnOf(const Date& date, const DateInterval& workout) {
  const double part = date.timeIntervalSinceDate(*workout.startDate()) / workout.duration();
  return static_cast<int>(std::fmax(0, std::fmin(part * columnsOfWorkout, columnsOfWorkout - 1)));
}

Columns columnsOf(const Array& readings, const DateInterval& workout) {
  Columns columns;
  for (const Ref<Object>& item : readings) {
    const auto* reading = cast<HeartRateSummaryReading>(item.get());
    if (reading == nullptr || !reading->date() || !reading->quantity()) continue;
    const double rate = std::round(beatsPerMinute(*reading->quantity()));
    if (!(rate >= 0 && rate < 1000)) continue;
    const auto [column, isNew] = columns.try_emplace(columnOf(*reading->date(), workout), Span{rate, rate});
    if (!isNew) column->second.add(rate);
  }
  return columns;
}

}  // namespace

Class& CHWorkoutDetailHeartRateChartView::staticClass() {
  using T = CHWorkoutDetailHeartRateChartView;
  static Class& result = ClassBuilder<T>("CHWorkoutDetailHeartRateChartView", View::staticClass())
                             .conformsTo("VLUIChartDataSource")
                             .instanceVariable<&T::heartRateReadings_>("_heartRateReadings")
                             .instanceVariable<&T::heartRateChartPoints_>("_heartRateChartPoints")
                             .instanceVariable<&T::chartView_>("_chartView")
                             .instanceVariable<&T::hasAdequateDataForDisplay_>("_hasAdequateDataForDisplay")
                             .instanceVariable<&T::workout_>("_workout")
                             .method<&T::_dateInterval>("_dateInterval")
                             .build();
  return result;
}

Ref<DateInterval> CHWorkoutDetailHeartRateChartView::_dateInterval() {
  if (!workout_ || !workout_->startDate() || !workout_->endDate()) return nullptr;
  return make<DateInterval>(workout_->startDate(), workout_->endDate());
}

Ref<DateInterval> CHWorkoutDetailHeartRateChartView::dateInterval() {
  return askDateInterval(*this);
}

void CHWorkoutDetailHeartRateChartView::showReadings() {
  const Ref<DateInterval> interval = dateInterval();
  if (heartRateChartPoints_ || !heartRateReadings_ || !interval || !(interval->duration() > 0)) return;
  const Columns columns = columnsOf(*heartRateReadings_, *interval);
  if (columns.empty()) return;
  Array::Items points;
  Span whole = columns.begin()->second;
  for (const auto& [column, span] : columns) {
    whole.add(span.lowest);
    whole.add(span.highest);
    points.push_back(make<VLUIChartPointMultiple>(
        interval->startDate()->dateByAddingTimeInterval(interval->duration() * column / columnsOfWorkout),
        make<VLUIChartValueSpan>(std::uint64_t(span.lowest), std::uint64_t(span.highest))));
  }
  hasAdequateDataForDisplay_ = points.size() >= fewestPoints;
  heartRateChartPoints_ = array(std::move(points));
  if (!chartView_) chartView_ = make<VLUIChartView>();
  chartView_->setRange(number(whole.lowest), number(whole.highest));
}

void CHWorkoutDetailHeartRateChartView::layoutSubviews() {
  showReadings();
  if (!chartView_) return;
  if (chartView_->superview() == nullptr) addSubview(chartView_);
  if (chartView_->frame() == Rect()) chartView_->setFrame(bounds());
}

static const RegisteredClass<CHWorkoutDetailHeartRateChartView> registered;

}  // namespace ax::host
