#include "bench/ChartFloors.h"

#include "bench/BundleSides.h"

namespace bench {

namespace {

constexpr double dayStart = benchNow - benchDay / 2;

std::string spanText(const IcuIntervals& spans, const IcuIntervals& last, double step, int index, int count) {
  const double start = dayStart + index * step;
  const bool isLast = index == count - 1;
  return isLast ? last.text(start, start + step - 1) : spans.text(start, start + step);
}

}  // namespace

double moveOfSpan(int span) {
  return 3 * (11 + 17 * span);
}

double figureOfBar(int bar) {
  return 4 + 0.37 * (bar % 97);
}

double startOfBar(int bar, int count) {
  return benchNow - (count - bar) * benchDay;
}

void MoveChartTexts::write(int count) {
  kept.clear();
  for (int i = 0; i < count; ++i) {
    kept.push_back(spanText(spans, lastSpan, 10800, i, count));
    kept.push_back(calories.text(figures.wideText(moveOfSpan(i))));
  }
}

void StandChartTexts::write(int count) {
  kept.clear();
  for (int i = 0; i < count; ++i) kept.push_back(spanText(hours, lastHour, 3600, i, count));
}

void TrendChartTexts::write(int count) {
  kept.clear();
  for (int i = 0; i < count; ++i) {
    const double start = startOfBar(i, count);
    kept.push_back(days.text(start, start + benchDay));
    kept.push_back(figures.text(static_cast<float>(figureOfBar(i))) + " kilometers");
  }
}

}  // namespace bench
