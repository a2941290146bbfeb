#include <nlohmann/json.hpp>

#include "tests/apps/ProgramTest.h"

namespace ax::app {

namespace {

using Json = nlohmann::ordered_json;

class CommandsTest : public ProgramTest {};

constexpr const char* oneButton = R"({
  "format": "axvelto-scene/1", "title": "Deck",
  "screen": {"class": "View", "set": {"frame": {"rect": [0, 0, 100, 100]}}, "subviews": [
    {"class": "PageControl", "id": "pages", "set": {"frame": {"rect": [0, 0, 100, 20]}, "numberOfPages": 3}},
    {"class": "Label", "id": "note", "set": {"frame": {"rect": [0, 50, 100, 20]}, "text": "Note"}}]}})";

std::string firstLine(const std::string& text) {
  return text.substr(0, text.find('\n'));
}

TEST_F(CommandsTest, RefuseBadUseWithOneLineAndNothingElse) {
  const std::string scene = file("deck.json", oneButton);
  const std::string cut = file("cut.tcx", "  <?xml version=\"1.0\"?><TrainingCenterDatabase><Activ");
  for (const std::string& arguments :
       {std::string(), std::string("speak"), std::string("shout x"), std::string("speak /nowhere/x.json"),
        std::string("speak /"), "speak " + scene + " --locale xx_YY",
        "speak " + scene + " --without Nobody.x", "graph " + scene + " --of nobody",
        "ask " + scene + " --activate nobody", "ask " + scene + " --at 1",
        "ask " + scene + " --activate pages --increment pages", "speak " + cut, "import " + scene}) {
    const Outcome outcome = run(arguments);
    EXPECT_EQ(outcome.code, 2) << arguments;
    EXPECT_EQ(outcome.out, "") << arguments;
    EXPECT_TRUE(outcome.err.starts_with("axvelto: ")) << arguments << ": " << outcome.err;
    EXPECT_EQ(outcome.err.find('\n'), outcome.err.size() - 1) << arguments << ": " << outcome.err;
  }
  EXPECT_NE(run("speak " + cut).err.find(cut), std::string::npos);
  EXPECT_NE(run("shout x").err.find("\"shout\""), std::string::npos);
}

TEST_F(CommandsTest, SpeakAndTreeReadAFileOrStandardInput) {
  const Outcome spoken = run("speak -", oneButton);
  EXPECT_EQ(spoken.code, 0);
  EXPECT_EQ(spoken.out, "Screen: Deck\nPage 1 of 3, adjustable\nNote\n");
  EXPECT_EQ(run("speak " + file("deck.json", oneButton)).out, spoken.out);
  EXPECT_EQ(firstLine(run("speak --locale de_DE -", oneButton).out), "Bildschirm: Deck");

  const Json tree = Json::parse(run("tree -", oneButton).out);
  EXPECT_EQ(tree["elements"][0]["id"], "pages");
  EXPECT_EQ(tree["elements"][0]["actions"], Json({"increment", "decrement"}));
  EXPECT_EQ(tree["elements"][1]["frame"], Json({0, 50, 100, 20}));
}

TEST_F(CommandsTest, ALanguageOfTheOtherDirectionTurnsTheScreenAround) {
  const std::string row = R"({"format": "axvelto-scene/1", "screen": {"class": "View",
    "set": {"frame": {"rect": [0, 0, 300, 50]}}, "subviews": [
    {"class": "Label", "set": {"frame": {"rect": [10, 0, 80, 20]}, "text": "One"}},
    {"class": "Label", "set": {"frame": {"rect": [110, 0, 80, 20]}, "text": "Two"}}]}})";
  const Json arabic = Json::parse(run("tree - --locale ar_EG", row).out)["elements"];
  EXPECT_EQ(arabic[0]["label"], "One");
  EXPECT_EQ(arabic[0]["frame"], Json({210, 0, 80, 20}));
  EXPECT_EQ(arabic[1]["label"], "Two");
  EXPECT_EQ(Json::parse(run("tree - --locale ja_JP", row).out)["elements"][0]["frame"],
            Json({10, 0, 80, 20}));

  const std::string month = run("speak " + sample("month.json") + " --locale ar_EG").out;
  EXPECT_LT(month.find("٢٣ فبراير"), month.find("١ مارس"));
}

// A touch on the header counts from the left in every language.
TEST_F(CommandsTest, TheWeekStaysBelowItsWeekdaysInEveryLanguage) {
  for (const char* locale : {"en_US", "ar_EG"}) {
    const Json week =
        Json::parse(run("tree " + sample("week-palette.json") + " --locale " + locale).out)["elements"];
    std::size_t first = 0;
    while (week[first]["value"].is_null()) ++first;
    for (std::size_t day = 0; day < 7; ++day) {
      const double weekday = week[first + day]["frame"][0];
      EXPECT_EQ(weekday, 6 + 54.0 * double(day)) << locale;
      EXPECT_EQ(week[first + 7 + day]["frame"][0], weekday + 2)
          << locale << ", read in the order of the week";
    }
  }
}

TEST_F(CommandsTest, AskComparesWithWhatTheSceneExpectsAndWritesItIn) {
  const std::string start = oneButton;
  const auto scene = [&](const std::string& more) { return start.substr(0, start.size() - 1) + more + "}"; };
  const std::string wrong = scene(R"(, "steps": [
    {"ask": "accessibilityValue", "of": "pages", "expect": "Page 9"},
    {"ask": "accessibilityElements", "of": "pages"}], "expect": {"speak": ["Screen: Deck"]})");
  const Outcome differs = run("ask -", wrong);
  EXPECT_EQ(differs.code, 1);
  EXPECT_NE(differs.err.find("/steps/0/expect"), std::string::npos) << differs.err;
  EXPECT_NE(differs.err.find("/expect/speak/1"), std::string::npos) << differs.err;
  EXPECT_EQ(std::count(differs.err.begin(), differs.err.end(), '\n'), 3) << differs.err;

  const std::string path = file("wrong.json", wrong);
  EXPECT_EQ(run("ask --accept " + path).code, 0);
  const Outcome holds = run("ask " + path);
  EXPECT_EQ(holds.code, 0) << holds.err;
  EXPECT_EQ(holds.err, "");
  EXPECT_EQ(run("ask --accept " + file("new.json", start)).code, 0);
  EXPECT_EQ(run("ask --accept -", start).code, 2);
}

TEST_F(CommandsTest, AskActsOnTheScreen) {
  const Outcome next = run("ask - --increment pages", oneButton);
  EXPECT_EQ(next.code, 0);
  EXPECT_EQ(firstLine(next.out), "Page 2 of 3, adjustable");

  const Outcome none = run("ask - --increment Note", oneButton);
  EXPECT_EQ(none.code, 1);
  EXPECT_EQ(none.out, "");
  EXPECT_NE(none.err.find("no increment of \"Note\""), std::string::npos);

  EXPECT_EQ(run("ask - --at 50,55", oneButton).out, "Note\n");
  EXPECT_EQ(run("ask - --at 50,99", oneButton).code, 1);
}

TEST_F(CommandsTest, GraphDescribesChartsOnAndBesideTheScreen) {
  const Outcome day = run("graph " + sample("day.json") + " --json");
  EXPECT_EQ(day.code, 0);
  EXPECT_GE(Json::parse(day.out)["charts"].size(), 4u);

  const std::string beside = R"({"format": "axvelto-scene/1", "objects": [
    {"class": "ActivityQuantityChart", "id": "energy"}, {"class": "View", "id": "plain"}]})";
  const Json charts = Json::parse(run("graph - --json", beside).out)["charts"];
  ASSERT_EQ(charts.size(), 1u);
  EXPECT_EQ(charts[0]["id"], "energy");
  EXPECT_EQ(charts[0]["slices"].size(), 8u);
  EXPECT_EQ(run("graph - --of plain", beside).code, 1);
  EXPECT_EQ(run("graph -", oneButton).code, 0);
}

TEST_F(CommandsTest, CheckTellsWhetherTheHostHolds) {
  EXPECT_EQ(run("check").code, 0);
  const Outcome broken = run("check --without CHFriendDetailGoalCell --json");
  EXPECT_EQ(broken.code, 1);
  EXPECT_NE(broken.out.find("Friend detail"), std::string::npos);
  // Classes that are named by the types of members alone.
  const std::pair<const char*, const char*> typesOfMembers[] = {{"_CHWorkoutDetailMapView", "Workout detail"},
                                                                {"ASCompetitionScoreView", "Friend list"}};
  for (const auto& [type, screen] : typesOfMembers) {
    const Outcome missing = run(std::string("check --without ") + type);
    EXPECT_EQ(missing.code, 1) << type;
    EXPECT_NE(missing.out.find(std::string("found no class ") + type), std::string::npos) << missing.out;
    EXPECT_NE(missing.out.find(screen), std::string::npos) << missing.out;
  }
  EXPECT_EQ(run("check -", R"({"format": "axvelto-scene/1", "environment": {"checks": false},
                               "host": {"without": ["LoadingView"]}})")
                .code,
            1);
}

TEST_F(CommandsTest, ImportGivesTheSceneThatSpeakSpeaks) {
  const std::string run1 = sample("workouts/morning-run.tcx"), ride = sample("workouts/evening-ride.gpx");
  const Outcome scene = run("import " + run1);
  EXPECT_EQ(scene.code, 0);
  EXPECT_EQ(run("speak -", scene.out).out, run("speak " + run1).out);

  const Outcome list = run("import " + run1 + " " + ride);
  EXPECT_EQ(list.code, 0);
  const std::string spoken = run("speak -", list.out).out;
  EXPECT_NE(spoken.find("Cycling"), std::string::npos);
  EXPECT_NE(spoken.find("Running"), std::string::npos);

  const Outcome elsewhere = run("import " + run1 + " --time-zone Asia/Tokyo");
  EXPECT_EQ(Json::parse(elsewhere.out)["environment"]["timeZone"], "Asia/Tokyo");
}

}  // namespace

}  // namespace ax::app
