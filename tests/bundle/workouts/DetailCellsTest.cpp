#include <gtest/gtest.h>

#include "host/workouts/CHWorkoutDetailExpandingHeaderView.h"
#include "host/workouts/CHWorkoutDetailMapAndWeatherTableViewCell.h"
#include "host/workouts/CHWorkoutDetailPaceTableViewCell.h"
#include "host/workouts/CHWorkoutDetailSplitTableViewCell.h"
#include "host/workouts/CHWorkoutDetailTwoValueTableViewCell.h"
#include "host/workouts/CHWorkoutSummaryTableViewCell.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/bundle/Answers.h"
#include "tests/bundle/StartedBundle.h"
#include "tests/bundle/workouts/SomeWorkout.h"
#include "tests/platform/EnvironmentScope.h"

// What scenes cannot show of a workout's own screen: cells that are used again, who owns what, and what is
// kept from one question to the next.
namespace ax {

namespace {

class DetailCellsTest : public testing::Test {
 protected:
  void SetUp() override { ASSERT_NO_FATAL_FAILURE(startBundle()); }

  static std::vector<TextAttribute> marksOf(const Ref<String>& text) {
    const auto* marked = cast<AccessibilityAttributedString>(text.get());
    return marked == nullptr ? std::vector<TextAttribute>() : marked->attributes();
  }

  const EnvironmentScope environment_{Environment{.locale = "en_US", .timeZone = "UTC", .now = 1780000000}};
};

class TwoValueCellTest : public DetailCellsTest {
 protected:
  void configure(const char* title, const Ref<Object>& value) {
    const Message<void(Ref<Object>, Ref<Object>)> first{"configureWithTitle1:value1:"};
    first(cell_, string(title), value);
  }

  const Message<Ref<Array>()> stored_{"_axElements"};
  Ref<host::CHWorkoutDetailTwoValueTableViewCell> cell_ = make<host::CHWorkoutDetailTwoValueTableViewCell>();
};

TEST_F(TwoValueCellTest, KeepsItsPairWhateverItShowsLater) {
  configure("Time", make<AttributedString>(string("12:34")));
  EXPECT_EQ(messages::accessibilityElements(cell_), nullptr) << "two labels are missing yet";
  EXPECT_EQ(stored_(cell_), nullptr);
  cell_->configureWithTitle2Value2(string("Distance"), string("5 km"));
  const Ref<Array> pair = messages::accessibilityElements(cell_);
  ASSERT_EQ(pair->count(), 2u);
  EXPECT_EQ(stored_(cell_), pair);
  configure("Pace", make<AttributedString>(string("5'30\"")));
  EXPECT_EQ(messages::accessibilityElements(cell_), pair);
  EXPECT_EQ(labelOf(pair->at(0)), "Pace");
  EXPECT_EQ(valueOf(pair->at(0)), "5'30\"");
  setMember(*cell_, "_titleLabel1", nullptr);
  EXPECT_EQ(messages::accessibilityElements(cell_), pair) << "it stands for the labels that it was made for";
  EXPECT_EQ(labelOf(pair->at(0)), "Pace");
}

TEST_F(TwoValueCellTest, ClearsTheSpokenFormOfTheValueBefore) {
  const auto spoken = make<AttributedString>(string("5 km"));
  messages::setAccessibilityLabel(spoken, string("5 kilometers"));
  const auto value = [&] { return labelOf(cell_->safeValueForKey("_valueLabel1"_key)); };
  configure("Distance", spoken);
  EXPECT_EQ(value(), "5 kilometers");
  configure("Distance", make<AttributedString>(string("6 km")));
  EXPECT_EQ(value(), "6 km");
  for (const char* missing : {"--", "--'--\"", "\u2013\u2013", "5 -- 6"}) {
    configure("Pace", make<AttributedString>(string(missing)));
    EXPECT_EQ(value(), "No data") << missing;
  }
  for (const char* shown : {"-", "- -", "\u2013-", "\u2013 \u2013"}) {
    configure("Pace", make<AttributedString>(string(shown)));
    EXPECT_EQ(value(), shown);
  }
  configure("Nothing", nullptr);
  EXPECT_EQ(value(), "(none)");
}

TEST_F(TwoValueCellTest, EndsWhileItsElementsLiveOn) {
  configure("Time", make<AttributedString>(string("12:34")));
  cell_->configureWithTitle2Value2(string("Distance"), string("5 km"));
  const Weak<Object> cell = *cell_;
  const Weak<Object> label = cell_->safeValueForKey("_titleLabel1"_key);
  Ref<Array> pair = messages::accessibilityElements(cell_);
  cell_ = nullptr;
  EXPECT_FALSE(cell);
  EXPECT_EQ(labelOf(pair->at(0)), "Time");
  EXPECT_EQ(messages::accessibilityContainer(pair->at(1)), nullptr);
  pair = nullptr;
  EXPECT_FALSE(label) << "the elements were the last to hold it";
}

TEST_F(TwoValueCellTest, LetsTheHostsOwnFaultThrough) {
  configure("Time", make<AttributedString>(string("--")));
  ASSERT_TRUE(setScriptedAnswer(*cell_, selectorFromString("configureWithTitle1:value1:"),
                                [](auto) -> Ref<Object> { throw std::runtime_error("no value"); }));
  EXPECT_THROW(configure("Time", make<AttributedString>(string("12:34"))), std::runtime_error);
  EXPECT_EQ(labelOf(cell_->safeValueForKey("_valueLabel1"_key)), "No data");
}

TEST_F(DetailCellsTest, ThePaceStaysWhileARideIsShown) {
  const auto cell = make<host::CHWorkoutDetailPaceTableViewCell>();
  cell->setWorkout(SomeWorkout{.seconds = 1650, .distance = 5}.made());
  EXPECT_EQ(labelOf(cell), "Average pace");
  EXPECT_EQ(valueOf(cell), "330 per kilometer");
  ASSERT_EQ(marksOf(messages::accessibilityValue(cell)).size(), 1u);
  cell->setWorkout(SomeWorkout{.sport = "cycling", .seconds = 3600, .distance = 25}.made());
  EXPECT_EQ(labelOf(cell), "Average pace");
  EXPECT_EQ(valueOf(cell), "330 per kilometer");
  load(cell);
  EXPECT_EQ(labelOf(cell), "Average speed") << "who loads it asks for what it shows";
  cell->setWorkout(SomeWorkout{.seconds = 600}.made());
  EXPECT_EQ(valueOf(cell), "No data");
}

// The split's cell derives from the pace's cell, and both are extended.
TEST_F(DetailCellsTest, ASplitSpeaksForItselfAfterItsBaseWasLoaded) {
  const auto cell = make<host::CHWorkoutDetailSplitTableViewCell>();
  const auto split = make<host::CHWorkoutSplit>();
  setMember(*split, "index", number(3));
  setMember(*split, "distance", quantity(0.5, Unit::unitFromString("km")));
  setMember(*split, "duration", number(165));
  cell->setSplit(split);
  const std::string spoken = "Split 3, 0.5 kilometers, 330 per kilometer";
  EXPECT_EQ(labelOf(cell), spoken);
  load(cell);
  EXPECT_EQ(labelOf(cell), spoken) << "what the base sets stands behind what the split answers";
  const Ref<Label> distance = member<Label>(*cell, "_distanceLabel");
  distance->setAlpha(0);
  EXPECT_EQ(labelOf(cell), "Split 3, 330 per kilometer");
  const auto marks = marksOf(messages::accessibilityLabel(cell));
  ASSERT_EQ(marks.size(), 1u);
  EXPECT_EQ(marks[0].range, (TextRange{9, 3}));
}

TEST_F(DetailCellsTest, AHeaderTogglesByItsButton) {
  const auto header = make<host::CHWorkoutDetailExpandingHeaderView>();
  header->setFrame({0, 100, 320, 40});
  EXPECT_EQ(messages::accessibilityActivationPoint(header), (Point{0, 0}));
  EXPECT_FALSE(messages::accessibilityActivate(header)) << "there is no button";
  setMember(*header, "_expandButton", make<Button>());
  header->layoutSubviews();
  EXPECT_EQ(messages::accessibilityActivationPoint(header), (Point{300, 120}));
  for (const std::int64_t status : {1, 2, 1, 2}) {
    EXPECT_TRUE(messages::accessibilityActivate(header));
    EXPECT_EQ(messages::_accessibilityExpandedStatus(header), status);
  }
  member<Button>(*header, "_expandButton")->setEnabled(false);
  EXPECT_FALSE(messages::accessibilityActivate(header));
  EXPECT_EQ(messages::_accessibilityExpandedStatus(header), 2);
  _accessibilityAddTrait(header, TraitSelected);
  EXPECT_EQ(messages::accessibilityTraits(header), TraitButton | TraitHeader);
}

TEST_F(DetailCellsTest, TheSummaryMarksItsDurationAlone) {
  const auto cell = make<host::CHWorkoutSummaryTableViewCell>();
  cell->setWorkouts(array({SomeWorkout{.seconds = 5025, .distance = 5, .kilocalories = 300}.made(),
                           SomeWorkout{.seconds = 1000, .distance = 3, .kilocalories = 100}.made()}));
  const auto marks = [&](const char* field) {
    return marksOf(messages::accessibilityLabel(cell->safeValueForKey(Selector::intern(field))));
  };
  ASSERT_EQ(marks("_durationLabel").size(), 2u) << "the total and the average";
  EXPECT_EQ(marks("_durationLabel")[0].key, DurationTimeHHMMSS);
  EXPECT_TRUE(marks("_distanceLabel").empty());
  const std::string text = labelOf(cell);
  std::string marked;
  for (const TextAttribute& mark : marksOf(messages::accessibilityLabel(cell)))
    marked += text.substr(mark.range.location, mark.range.length) + ";";
  EXPECT_EQ(marked, "1:40:25;50:13;");
}

class WeatherTest : public DetailCellsTest {
 protected:
  void SetUp() override {
    DetailCellsTest::SetUp();
    view_->setTemperature(number(18));
    view_->setHumidity(number(0.5));
    setMember(*view_, "_twcButton", make<Button>());
    view_->setFrame({0, 200, 320, 40});
  }
  Ref<host::CHWorkoutDetailWeatherView> view_ = make<host::CHWorkoutDetailWeatherView>();
};

TEST_F(WeatherTest, IsSummedUpOnce) {
  view_->setWeatherCondition(1);
  const Ref<Array> elements = messages::accessibilityElements(view_);
  ASSERT_EQ(elements->count(), 2u);
  const std::string summary = labelOf(elements->at(0));
  EXPECT_NE(summary.find("18 degrees, 50% humidity"), std::string::npos) << summary;
  EXPECT_EQ(messages::accessibilityFrame(elements->at(0)), (Rect{0, 200, 200, 40}));
  EXPECT_EQ(elements->at(1), view_->safeValueForKey("_twcButton"_key));

  view_->setTemperature(number(25));
  view_->setWeatherCondition(2);
  view_->setFrame({10, 300, 320, 40});
  EXPECT_EQ(messages::accessibilityElements(view_), elements);
  EXPECT_EQ(labelOf(elements->at(0)), summary);
  EXPECT_EQ(messages::accessibilityFrame(elements->at(0)), (Rect{10, 300, 200, 40})) << "it moves along";
}

TEST_F(WeatherTest, KeepsTheNameOfAPictureThatIsGone) {
  view_->setWeatherCondition(1);
  const Ref<ImageView> picture = member<ImageView>(*view_, "_weatherConditionImageView");
  const std::string name = labelOf(picture);
  ASSERT_NE(name, "(none)");
  view_->setWeatherCondition(0);
  EXPECT_EQ(picture->image(), nullptr);
  EXPECT_EQ(labelOf(picture), name);
  EXPECT_TRUE(messages::isAccessibilityElement(picture));
}

TEST_F(WeatherTest, FollowsItsMapInTheCell) {
  const auto cell = make<host::CHWorkoutDetailMapAndWeatherTableViewCell>();
  setMember(*cell, "_weatherView", view_);
  const Ref<Array> alone = messages::accessibilityElements(cell);
  EXPECT_TRUE(alone->isEqual(*array({view_})));
  const auto map = make<host::CHWorkoutDetailMapViewInCell>();
  map->setFrame({0, 0, 320, 100});
  setMember(*cell, "_mapView", map);
  EXPECT_TRUE(messages::accessibilityElements(cell)->isEqual(*array({map, view_})));
  EXPECT_NE(messages::accessibilityElements(cell), messages::accessibilityElements(cell)) << "made anew";
  // The map in the cell is a refinement of the one that is extended.
  EXPECT_TRUE(messages::isAccessibilityElement(map));
  EXPECT_EQ(messages::accessibilityFrame(map), Rect()) << "nothing in it shows yet";
  const auto route = make<View>();
  route->setFrame({20, 10, 50, 60});
  map->addSubview(route);
  EXPECT_EQ(messages::accessibilityFrame(map), (Rect{20, 10, 50, 60}));
}

}  // namespace

}  // namespace ax
