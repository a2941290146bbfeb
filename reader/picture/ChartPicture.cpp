#include <cmath>

#include "platform/formatting/Dates.h"
#include "platform/formatting/Numbers.h"
#include "platform/formatting/Region.h"
#include "reader/picture/ChartShapes.h"
#include "reader/picture/ChartValues.h"
#include "reader/picture/PictureStyle.h"
#include "reader/picture/ScreenPicture.h"
#include "reader/snapshot/ShownSeries.h"
#include "reader/speech/ChartWords.h"
#include "reader/text/ReaderStrings.h"

namespace ax::reader {

namespace {

constexpr Rect whole = {0, 0, 360, 210};
constexpr double fontSize = 11;
constexpr double edge = 4;

std::string number(double value) {
  return formatting::decimalString(value, 2);
}

std::string textOf(const std::optional<AttributedText>& text) {
  return text ? text->text : std::string();
}

// "Heart rate, beats per minute"; a title that is the unit itself is not said again.
std::string titleOf(const DataSeriesAxis& axis) {
  const std::string title = textOf(axis.title), unit = unitName(axis);
  return joined({title == textOf(axis.unitLabel) || title == unit ? std::string() : title, unit});
}

struct Tick {
  double position;  // along the horizontal axis, 0 to 1
  std::string text;
};

std::string timeOf(double seconds) {
  return formatting::dateString(seconds, "h:mma");
}

// What the chart says of the ends and the middle, else the times of its slices, else the numbers at the ends.
std::vector<Tick> ticksOf(const DataSeries& series, const AxisRange& range) {
  std::vector<Tick> ticks;
  for (const auto& [position, text] : series.axes[horizontalAxis].positions) {
    if (position == 0 || position == 0.5 || position == 1) ticks.push_back({position, text.text});
  }
  if (!ticks.empty()) return ticks;
  if (!series.slices.empty() && series.slices.front().startTime && series.slices.back().endTime) {
    return {{0, timeOf(*series.slices.front().startTime)}, {1, timeOf(*series.slices.back().endTime)}};
  }
  if (!series.hasAxes) return {};
  return {{0, number(range.low)}, {1, number(range.high)}};
}

class ChartDrawingWithAxes {
 public:
  explicit ChartDrawingWithAxes(const DataSeries& series)
      : series_(series),
        values_(chartValues(series)),
        isRightToLeft_(formatting::currentLanguageIsRightToLeft()) {}

  std::string svg(const std::string& name) {
    openPicture(svg_, whole, name);
    svg_.empty(
        "rect",
        {{"class", "ground"}, {"width", whole.width}, {"height", whole.height}, {"fill", colours::ground}});
    const Rect plot = plotArea();
    addGuide(plot);
    addChartShapes(svg_, drawChart(series_, plot));
    addTitles(plot);
    addTicks(plot);
    return svg_.close().take();
  }

 private:
  std::string highest() const { return number(values_.y.high); }
  std::string lowest() const { return number(values_.y.low); }

  Rect plotArea() const {
    constexpr double digit = 0.6;
    const std::size_t longest = series_.hasAxes ? std::max(highest().size(), lowest().size()) : 0;
    const double left = 2 * edge + digit * fontSize * double(longest);
    constexpr double above = 2.4 * fontSize, below = 3.4 * fontSize;
    return {left, above, whole.width - left - 3 * edge, whole.height - above - below};
  }

  // Faintly, the end of the vertical axis.
  void addGuide(const Rect& plot) {
    const std::string line = std::string("M") + markupNumber(plot.x) + " " + markupNumber(plot.y) + "H" +
                             markupNumber(plot.maxX());
    svg_.empty("path",
               {{"class", "guide"}, {"d", line}, {"stroke", colours::outline}, {"stroke-width", 0.5}});
  }

  // `side` is -1 for a text that begins on the left at x, 0 for one around it, 1 for one that ends there.
  void addText(double x, double y, int side, const std::string& text) {
    if (text.empty()) return;
    const int along = isRightToLeft_ ? -side : side;
    svg_.element("text",
                 {{"class", "label"},
                  {"x", x},
                  {"y", y},
                  {"font-size", fontSize},
                  {"direction", isRightToLeft_ ? "rtl" : "ltr"},
                  {"text-anchor", along < 0    ? "start"
                                  : along == 0 ? "middle"
                                               : "end"},
                  {"fill", colours::ink}},
                 text);
  }

  void addTitles(const Rect& plot) {
    if (!series_.hasAxes) return;
    const double start = isRightToLeft_ ? plot.maxX() : edge;
    addText(start, fontSize + edge, isRightToLeft_ ? 1 : -1, titleOf(series_.axes[verticalAxis]));
    // Its ends are times or days, not figures of a unit, where the chart tells them.
    const bool hasFigures = series_.axes[horizontalAxis].positions.empty();
    addText(plot.center().x, whole.height - 2 * edge, 0,
            hasFigures ? titleOf(series_.axes[horizontalAxis]) : textOf(series_.axes[horizontalAxis].title));
    if (values_.values.empty()) return;
    constexpr double middle = 0.36 * fontSize;
    addText(plot.x - edge, plot.y + middle, 1, highest());
    addText(plot.x - edge, plot.maxY() + middle, 1, lowest());
  }

  void addTicks(const Rect& plot) {
    const double below = plot.maxY() + 1.4 * fontSize;
    for (const auto& [position, text] : ticksOf(series_, values_.x)) {
      const int side = position == 0 ? -1 : position == 1 ? 1 : 0;
      addText(plot.x + position * plot.width, below, side, text);
    }
  }

  const DataSeries& series_;
  ChartValues values_;
  bool isRightToLeft_;
  Markup svg_;
};

}  // namespace

std::string chartPicture(const Snapshot& snapshot, const Node& chart, const std::string& name) {
  return chartPicture(shownSeries(snapshot, chart), name);
}

std::string chartPicture(const DataSeries& series, const std::string& name) {
  return ChartDrawingWithAxes(series).svg(name);
}

}  // namespace ax::reader
