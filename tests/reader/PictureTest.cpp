#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <pugixml.hpp>

#include "platform/foundation/Environment.h"
#include "reader/picture/ChartDrawing.h"
#include "reader/picture/NumberMarks.h"
#include "reader/picture/ScreenPicture.h"
#include "tests/reader/ScreenPieces.h"

namespace ax::reader::testing {

namespace {

constexpr double none = std::numeric_limits<double>::quiet_NaN();
constexpr Rect plot = {100, 50, 240, 100};

Rect rectOf(const pugi::xml_node& node) {
  return {node.attribute("x").as_double(), node.attribute("y").as_double(),
          node.attribute("width").as_double(), node.attribute("height").as_double()};
}

bool overlap(const Rect& a, const Rect& b) {
  return a.x < b.maxX() && b.x < a.maxX() && a.y < b.maxY() && b.y < a.maxY();
}

// A picture, read again by what reads XML.
class Picture {
 public:
  explicit Picture(const Ref<View>& screen, const std::string& title = "Screen") {
    const Snapshot snapshot = takeSnapshot(screen);
    const std::string svg = screenPicture(snapshot, ReadingOrder(snapshot), title);
    EXPECT_TRUE(document_.load_string(svg.c_str())) << svg;
  }

  pugi::xml_node root() const { return document_.child("svg"); }
  std::vector<std::string> numbers() const {
    std::vector<std::string> texts;
    for (const auto& text : root().children("text")) texts.emplace_back(text.text().get());
    return texts;
  }
  std::vector<Rect> rects(const std::string& className) const {
    std::vector<Rect> found;
    for (const auto& rect : root().children("rect")) {
      if (rect.attribute("class").value() == className) found.push_back(rectOf(rect));
    }
    return found;
  }

 private:
  pugi::xml_document document_;
};

DataSeries bars(std::vector<double> x, std::vector<double> y) {
  DataSeries series;
  series.hasAxes = true;
  series.type = 2;
  series.axes[horizontalAxis].values = std::move(x);
  series.axes[verticalAxis].values = std::move(y);
  return series;
}

DataSeries line(std::vector<double> x, std::vector<double> y) {
  DataSeries series = bars(std::move(x), std::move(y));
  series.type = 0;
  return series;
}

DataSeries slices(const std::vector<std::string>& quantities) {
  DataSeries series;
  series.usesSlices = true;
  for (const std::string& quantity : quantities) {
    const double start = 10.0 * double(series.slices.size());
    series.slices.push_back({start, start + 10, AttributedText{quantity}});
  }
  return series;
}

std::vector<double> heights(const DataSeries& series) {
  std::vector<double> all;
  for (const Rect& bar : drawChart(series, plot).bars) all.push_back(std::round(bar.height));
  return all;
}

}  // namespace

TEST(PictureTest, NumbersEveryFrameInReadingOrder) {
  const Ref<Label> hidden = label("Hidden", {0, 100, 400, 20});
  hidden->setHidden(true);
  const Ref<View> screen =
      view({label("Second", {0, 60, 400, 20}), button("First", {10, 0, 200, 40}), hidden});
  const Picture picture(screen);
  EXPECT_EQ(picture.numbers(), (std::vector<std::string>{"1", "2"}));
  EXPECT_EQ(picture.rects("frame control"), (std::vector<Rect>{{10, 0, 200, 40}}));
  EXPECT_EQ(picture.rects("frame"), (std::vector<Rect>{{0, 60, 400, 20}}));
  EXPECT_EQ(std::string(picture.root().attribute("viewBox").value()), "-8 -8 416 96");
}

TEST(PictureTest, SetsNumbersOfElementsWithoutAFrameAboveTheScreen) {
  std::vector<Ref<View>> labels;
  const Ref<View> screen = view({label("Here", {0, 0, 320, 20})});
  const double far = 1e300;
  for (const Rect& frame : {Rect{}, Rect{0, 0, 50, 0}, Rect{far, 0, 20, 20}, Rect{0, 0, none, 20}}) {
    screen->addSubview(label("Nowhere", frame));
  }
  for (int i = 0; i < 40; ++i) screen->addSubview(label("Nowhere", {}));
  const Picture picture(screen);
  const Rect whole = rectOf(picture.root().find_child_by_attribute("class", "ground"));
  EXPECT_EQ(picture.numbers().size(), 45u);
  int above = 0;
  const std::vector<Rect> marks = picture.rects("mark");
  for (const Rect& mark : marks) {
    above += mark.maxY() <= 0 ? 1 : 0;
    EXPECT_GE(mark.y, whole.y);
    EXPECT_LE(mark.maxX(), whole.maxX());
    for (const Rect& other : marks) EXPECT_TRUE(&mark == &other || !overlap(mark, other));
  }
  EXPECT_EQ(above, 44);
}

TEST(PictureTest, StandsWhateverTheTextsHold) {
  const Picture picture(view({label("a")}), "Ada's \"<1>\" & \xFF\x01 \U0001F3C3");
  EXPECT_EQ(std::string(picture.root().attribute("aria-label").value()), "Ada's \"<1>\" & \uFFFD \U0001F3C3");
}

TEST(PictureTest, BeginsOnTheRightWhereTheLanguageDoes) {
  setEnvironment({.locale = "ar_EG"});
  const Picture picture(view({label("a", {0, 0, 400, 40})}));
  EXPECT_EQ(picture.numbers().at(0), "\u0661");
  EXPECT_EQ(picture.rects("mark").at(0).maxX(), 399);
  setEnvironment({});
}

TEST(NumberMarksTest, ShareAFrameAndShrinkIntoSmallOnes) {
  NumberMarks marks(false);
  const Rect frame = {10, 10, 60, 40};
  std::vector<Rect> placed;
  for (int i = 0; i < 4; ++i) placed.push_back(marks.place(frame, 2).rect);
  for (std::size_t i = 0; i < placed.size(); ++i) {
    EXPECT_TRUE(placed[i].x >= frame.x && placed[i].maxX() <= frame.maxX());
    EXPECT_TRUE(placed[i].y >= frame.y && placed[i].maxY() <= frame.maxY());
    for (std::size_t j = 0; j < i; ++j) EXPECT_FALSE(overlap(placed[i], placed[j]));
  }
  const auto [small, fontSize] = marks.place({200, 0, 8, 100}, 4);
  EXPECT_LT(fontSize, NumberMarks::largestType);
  EXPECT_LE(small.maxX(), 208);
}

TEST(ChartDrawingTest, DrawsBarsOfTheirHeight) {
  DataSeries series = bars({0, 1, 2, 23}, {2, 0, 4, 99});
  series.axes[horizontalAxis].maximum = 24;
  series.axes[verticalAxis].maximum = 8;
  EXPECT_EQ(heights(series), (std::vector<double>{25, 0, 50, 100})) << "none is higher than its axis";
  const ChartDrawing drawing = drawChart(series, plot);
  EXPECT_NEAR(drawing.bars[0].x, 101, 1e-9);  // a place is 10 wide, a tenth of it free on each side
  EXPECT_NEAR(drawing.bars[0].width, 8, 1e-9);
  EXPECT_NEAR(drawing.bars[3].maxX(), 339, 1e-9);
  EXPECT_EQ(drawing.bars[0].maxY(), 150);

  EXPECT_EQ(heights(bars({0, 1}, {-1, 3})), (std::vector<double>{25, 75})) << "from 0 down and up";
  EXPECT_EQ(heights(bars({0, 1, 2}, {1, none, 2})), (std::vector<double>{50, 100}));
  EXPECT_TRUE(drawChart(bars({}, {}), plot).bars.empty());
}

TEST(ChartDrawingTest, ShowsNothingWhereTheChartHasNoBar) {
  const Snapshot screen = takeSnapshot(view({label("a", {0, 0, 10, 80}), label("b", {20, 0, 10, 80})}));
  Node chart;
  chart.frame = {0, 0, 30, 80};
  for (const Node& bar : screen.nodes()) chart.children.push_back(bar.id);
  const auto drawn = [&](std::vector<double> values) {
    chart.series = bars({0, 1, 2}, std::move(values));
    return drawChartOnScreen(screen, chart).bars;
  };
  ASSERT_EQ(drawn({2, 0, 4}).size(), 2u);
  EXPECT_NEAR(drawn({2, 0, 4})[1].x, 21, 1e-9) << "over its own element";
  EXPECT_EQ(drawn({2, 1, 4}).size(), 3u) << "a value is no gap";
}

TEST(ChartDrawingTest, SetsBarsOfOneDaySideBySide) {
  const ChartDrawing drawing = drawChart(bars({0, 0.1, 1, 1.1, 2, 2.1}, {1, 2, 1, 2, 1, 2}), plot);
  ASSERT_EQ(drawing.bars.size(), 6u);
  for (const Rect& bar : drawing.bars) EXPECT_NEAR(bar.width, 32, 1e-9);
}

TEST(ChartDrawingTest, BreaksLinesAtGaps) {
  const auto drawing = drawChart(line({0, 1, 2, 3, 7, 8, 9, 10}, {10, 20, none, 15, 10, 10, 20, 10}), plot);
  ASSERT_EQ(drawing.lines.size(), 3u);  // for want of a number, and of a reading
  EXPECT_EQ(drawing.lines[0], (std::vector<Point>{{100, 150}, {124, 50}}));
  EXPECT_EQ(drawing.lines[1], (std::vector<Point>{{172, 100}}));
  EXPECT_EQ(drawing.lines[2].size(), 4u);
  EXPECT_EQ(drawChart(line({5}, {7}), plot).lines.size(), 1u);
}

TEST(ChartDrawingTest, ReadsTheNumbersOfSlices) {
  const auto ranges = drawChart(slices({"100 to 1,200 beats", "", "650 beats"}), plot).bars;
  ASSERT_EQ(ranges.size(), 2u);
  EXPECT_EQ(ranges[0].y, 50);
  EXPECT_EQ(ranges[0].height, 100);
  EXPECT_NEAR(ranges[1].y, 100, 1e-9);

  const std::vector<double> minutes = {0, 38, 75, 100};
  EXPECT_EQ(heights(slices({"0 minutes", "45 minutes", "1 hour, 30 minutes", "2 hours"})), minutes);
  setEnvironment({.locale = "ar_EG"});
  EXPECT_EQ(heights(slices({"٠ دقيقة", "٤٥ دقيقة", "ساعة واحدة و٣٠ دقيقة", "ساعتان"})), minutes);
  setEnvironment({});
}

TEST(ChartDrawingTest, SurvivesValuesOfABrokenHost) {
  const double huge = std::numeric_limits<double>::max();
  for (const double odd : {huge, -huge, none, HUGE_VAL}) {
    DataSeries series = bars({odd, 1, odd}, {1, odd, 2});
    series.axes[horizontalAxis].minimum = odd;
    series.axes[verticalAxis].maximum = odd;
    EXPECT_LE(drawChart(series, plot).bars.size(), 3u);
    EXPECT_FALSE(chartPicture(series, "odd").empty());
  }
}

}  // namespace ax::reader::testing
