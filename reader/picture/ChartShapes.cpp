#include "reader/picture/ChartShapes.h"

#include <algorithm>

#include "reader/picture/PictureStyle.h"

namespace ax::reader {

namespace {

// A bar of no height is still seen to be there.
constexpr double thinnest = 1;

void addBar(Markup& svg, const Rect& bar) {
  const double height = std::max(bar.height, thinnest);
  svg.empty("rect", {{"class", "bar"},
                     {"x", bar.x},
                     {"y", bar.maxY() - height},
                     {"width", bar.width},
                     {"height", height},
                     {"fill", colours::data}});
}

std::string pointsOf(const std::vector<Point>& line) {
  std::string points;
  for (const Point& point : line) {
    if (!points.empty()) points += ' ';
    points += markupNumber(point.x) + "," + markupNumber(point.y);
  }
  return points;
}

void addLine(Markup& svg, const std::vector<Point>& line) {
  constexpr double dot = 2;
  if (line.size() == 1) {
    svg.empty("circle", {{"class", "bar"},
                         {"cx", line.front().x},
                         {"cy", line.front().y},
                         {"r", dot},
                         {"fill", colours::data}});
    return;
  }
  svg.empty("polyline", {{"class", "curve"},
                         {"points", pointsOf(line)},
                         {"fill", "none"},
                         {"stroke", colours::data},
                         {"stroke-width", 2.0},
                         {"stroke-linejoin", "round"}});
}

}  // namespace

void addChartShapes(Markup& svg, const ChartDrawing& drawing) {
  const Rect& plot = drawing.plot;
  for (const Rect& bar : drawing.bars) addBar(svg, bar);
  for (const std::vector<Point>& line : drawing.lines) addLine(svg, line);
  const std::string axes = std::string("M") + markupNumber(plot.x) + " " + markupNumber(plot.y) + "V" +
                           markupNumber(plot.maxY()) + "H" + markupNumber(plot.maxX());
  svg.empty("path", {{"class", "axis"}, {"d", axes}, {"fill", "none"}, {"stroke", colours::ink}});
}

}  // namespace ax::reader
