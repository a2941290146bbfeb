#include "reader/picture/ScreenPicture.h"

#include <algorithm>
#include <cmath>
#include <unordered_map>
#include <unordered_set>

#include "platform/formatting/Numbers.h"
#include "platform/formatting/Region.h"
#include "reader/picture/ChartDrawing.h"
#include "reader/picture/ChartShapes.h"
#include "reader/picture/NumberMarks.h"
#include "reader/picture/PictureStyle.h"
#include "reader/snapshot/Charts.h"

namespace ax::reader {

namespace {

constexpr double margin = 8;
constexpr double narrowest = 320;
constexpr double farthest = 1e6;  // points; what lies beyond is nowhere

struct RoleStyle {
  Role role;
  const char* className;
  const char* fill;
  double lineWidth;
  double radius;
};

constexpr RoleStyle roleStyles[] = {{Role::header, "frame header", colours::fill, 2, 0},
                                    {Role::button, "frame control", colours::control, 1, 8},
                                    {Role::link, "frame control", colours::control, 1, 0},
                                    {Role::adjustable, "frame control", colours::control, 1, 12}};
constexpr RoleStyle plainStyle = {Role::element, "frame", colours::fill, 1, 0};

const RoleStyle& styleOf(Role role) {
  for (const RoleStyle& style : roleStyles) {
    if (style.role == role) return style;
  }
  return plainStyle;
}

bool hasPlace(const Node& node) {
  const Rect& frame = node.frame;
  const bool isNear = std::abs(frame.x) < farthest && std::abs(frame.y) < farthest &&
                      frame.width < farthest && frame.height < farthest;
  return isNear && !frame.isEmpty();
}

std::size_t lengthOf(std::string_view utf8) {
  return std::size_t(std::ranges::count_if(utf8, [](char c) { return (c & 0xC0) != 0x80; }));
}

void addRect(Markup& svg, const Rect& rect, const RoleStyle& style, const char* fill) {
  svg.empty("rect", {{"class", style.className},
                     {"x", rect.x},
                     {"y", rect.y},
                     {"width", rect.width},
                     {"height", rect.height},
                     {"rx", style.radius > 0 ? Attribute("", style.radius).value : std::nullopt},
                     {"fill", fill},
                     {"stroke", colours::outline},
                     {"stroke-width", style.lineWidth}});
}

class ScreenDrawing {
 public:
  ScreenDrawing(const Snapshot& snapshot, const ReadingOrder& order)
      : snapshot_(snapshot),
        order_(order),
        isFromTheRight_(formatting::currentLanguageIsRightToLeft()),
        marks_(isFromTheRight_) {
    for (const Node* chart : charts(snapshot)) {
      for (const Node* element : elementsOfChart(snapshot, *chart)) inCharts_.insert(element->id);
    }
    findScreen();
    placeNumbersWithoutFrame();
  }

  std::string svg(const std::string& title) {
    openPicture(svg_, area_, title);
    addScreen();
    for (const Node& node : snapshot_.nodes()) addFrame(node);
    for (const Node* chart : charts(snapshot_)) {
      if (hasPlace(*chart)) addChartShapes(svg_, drawChartOnScreen(snapshot_, *chart));
    }
    for (std::size_t i = 0; i < order_.nodes().size(); ++i) addNumber(*order_.nodes()[i], i + 1);
    return svg_.close().take();
  }

 private:
  void findScreen() {
    screen_ = {0, 0, narrowest, 0};
    for (const Node& node : snapshot_.nodes()) {
      if (hasPlace(node)) screen_ = screen_.unionWith(node.frame);
    }
    area_ = {screen_.x - margin, screen_.y - margin, screen_.width + 2 * margin, screen_.height + 2 * margin};
  }

  // In rows above the screen, in reading order.
  void placeNumbersWithoutFrame() {
    double along = 0;
    double row = 0;
    for (std::size_t i = 0; i < order_.nodes().size(); ++i) {
      if (hasPlace(*order_.nodes()[i])) continue;
      const auto [width, height] = NumberMarks::sizeOf(NumberMarks::largestType, lengthOf(numberText(i + 1)));
      if (along + width > screen_.width) {
        along = 0;
        row += height + gap;
      }
      const double x = isFromTheRight_ ? screen_.maxX() - along - width : screen_.x + along;
      outside_.emplace(order_.nodes()[i]->id, Rect{x, row, width, height});
      along += width + gap;
    }
    if (outside_.empty()) return;
    const double height = row + NumberMarks::sizeOf(NumberMarks::largestType, 1).height + margin;
    for (auto& [id, rect] : outside_) rect.y += screen_.y - height;
    area_.y -= height;
    area_.height += height;
  }

  static std::string numberText(std::size_t number) {
    return formatting::plainIntegerString(std::int64_t(number));
  }

  void addScreen() {
    const auto& [x, y, width, height] = screen_;
    svg_.empty("rect", {{"class", "ground"},
                        {"x", area_.x},
                        {"y", area_.y},
                        {"width", area_.width},
                        {"height", area_.height},
                        {"fill", colours::ground}});
    svg_.empty("rect", {{"class", "container"},
                        {"x", x},
                        {"y", y},
                        {"width", width},
                        {"height", height},
                        {"fill", "none"},
                        {"stroke", colours::outline},
                        {"stroke-width", thin}});
  }

  void addFrame(const Node& node) {
    if (!hasPlace(node)) return;
    if (!node.isElement) {
      addRect(svg_, node.frame, {Role::container, "container", "none", thin, 0}, "none");
    } else {
      const RoleStyle& style = styleOf(node.role);
      addRect(svg_, node.frame, style, inCharts_.contains(node.id) ? "none" : style.fill);
    }
  }

  void addNumber(const Node& node, std::size_t number) {
    const std::string text = numberText(number);
    const auto found = outside_.find(node.id);
    const auto [rect, fontSize] = found == outside_.end()
                                      ? marks_.place(node.frame, lengthOf(text))
                                      : NumberMarks::Mark{found->second, NumberMarks::largestType};
    constexpr double roundness = 3;
    constexpr double baseline = 0.36;  // of the type's size, below the middle
    svg_.empty("rect", {{"class", "mark"},
                        {"x", rect.x},
                        {"y", rect.y},
                        {"width", rect.width},
                        {"height", rect.height},
                        {"rx", std::min(roundness, rect.height / 4)},
                        {"fill", colours::ink}});
    svg_.element("text",
                 {{"class", "number-in-picture"},
                  {"x", rect.center().x},
                  {"y", rect.center().y + baseline * fontSize},
                  {"font-size", fontSize},
                  {"text-anchor", "middle"},
                  {"fill", colours::ground}},
                 text);
  }

  static constexpr double thin = 0.75;
  static constexpr double gap = 4;

  const Snapshot& snapshot_;
  const ReadingOrder& order_;
  bool isFromTheRight_;
  NumberMarks marks_;
  std::unordered_set<NodeId> inCharts_;
  std::unordered_map<NodeId, Rect> outside_;  // the places of numbers without a frame
  Rect screen_;
  Rect area_;  // of the picture
  Markup svg_;
};

}  // namespace

std::string screenPicture(const Snapshot& snapshot, const ReadingOrder& order, const std::string& title) {
  return ScreenDrawing(snapshot, order).svg(title);
}

}  // namespace ax::reader
