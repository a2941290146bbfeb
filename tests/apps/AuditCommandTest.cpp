#include <nlohmann/json.hpp>
#include <set>

#include "tests/apps/ProgramTest.h"

namespace ax::app {

namespace {

using Json = nlohmann::ordered_json;

struct FaultyScreen {
  const char* rule;
  const char* parts;  // of a screen of 300 by 600 points
  std::size_t count;  // of findings
  const char* what = "";
};

// One screen for each rule, with that fault and no other.
constexpr FaultyScreen faultyScreens[] = {
    {"unspoken-text",
     R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "New", "isAccessibilityElement": false}})",
     1, "is said by no element"},
    {"other-words",
     R"({"class": "View", "set": {"frame": {"rect": [0, 0, 200, 50]}, "isAccessibilityElement": true,
                                  "accessibilityLabel": "Monday, 5 kilometers"}, "subviews": [
        {"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "Monday"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 20, 90, 20]}, "text": "05"}},
        {"class": "Label", "set": {"frame": {"rect": [100, 0, 90, 20]}, "text": "3 laps"}}]})",
     1, "Monday, 5 kilometers"},
    {"no-label",
     R"({"class": "View", "set": {"frame": {"rect": [0, 0, 90, 20]}, "isAccessibilityElement": true}})", 1},
    {"raw-key", R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "friend.list"}},
                   {"class": "Label", "set": {"frame": {"rect": [0, 30, 90, 20]}, "text": "Level 3.5"}})",
     1, "friend.list"},
    {"abbreviation",
     R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "5.2 km"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 30, 90, 20]}, "text": "Well done 🎉"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 60, 90, 20]}, "text": "349/500"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 90, 90, 20]}, "text": "5 miles"}})",
     3, "km"},
    {"said-twice",
     R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "Run, Steps, Run"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 30, 90, 20]}, "text": "10, 10"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 60, 90, 20]}, "text": "Walk"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 90, 90, 20]}, "text": "Walk"}})",
     2, "Run"},
    {"role-in-label",
     R"({"class": "Button", "set": {"frame": {"rect": [0, 0, 90, 30]}, "title": "sort button"}},
        {"class": "Button", "set": {"frame": {"rect": [0, 50, 90, 30]}, "title": "buttonhole"}})",
     1, "button"},
    {"no-area", R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 0]}, "text": "Flat"}})", 1},
    {"outside-screen",
     R"({"class": "Label", "set": {"frame": {"rect": [400, 0, 90, 20]}, "text": "Far"}},
        {"class": "ScrollView", "set": {"frame": {"rect": [0, 50, 300, 50]}}, "subviews": [
          {"class": "Label", "set": {"frame": {"rect": [400, 0, 90, 20]}, "text": "Next page"}}]})",
     1, "outside"},
    {"small-target",
     R"({"class": "Button", "set": {"frame": {"rect": [0, 0, 90, 23]}, "title": "Thin"}},
        {"class": "Button", "set": {"frame": {"rect": [0, 50, 24, 24]}, "title": "Enough"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 90, 9, 9]}, "text": "Only read"}})",
     1, "90 by 23 points"},
    {"overlap",
     R"({"class": "Button", "set": {"frame": {"rect": [0, 0, 90, 40]}, "title": "Under"}},
        {"class": "Button", "set": {"frame": {"rect": [0, 30, 90, 40]}, "title": "Over"}},
        {"class": "Button", "set": {"frame": {"rect": [0, 70, 90, 40]}, "title": "Beside"}})",
     1, "Under"},
    {"same-name",
     R"({"class": "Button", "set": {"frame": {"rect": [0, 0, 90, 30]}, "title": "Details"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 40, 90, 20]}, "text": "Run"}},
        {"class": "Button", "set": {"frame": {"rect": [0, 70, 90, 30]}, "title": "Details"}})",
     1, "element 1"},
    {"order",
     R"({"class": "View", "set": {"frame": {"rect": [0, 0, 300, 300]},
                                  "accessibilityElements": [{"ref": "low"}, {"ref": "high"}, {"ref": "before"}]},
         "subviews": [
        {"class": "Label", "id": "low", "set": {"frame": {"rect": [0, 100, 90, 20]}, "text": "Low"}},
        {"class": "Label", "id": "high", "set": {"frame": {"rect": [50, 0, 90, 20]}, "text": "High"}},
        {"class": "Label", "id": "before", "set": {"frame": {"rect": [0, 0, 40, 20]}, "text": "Before"}}]})",
     2, "High"},
    {"chart-without-words",
     R"({"class": "Velto.ActivityMoveAndExerciseChartView",
         "set": {"frame": {"rect": [0, 0, 300, 200]}, "moveAndExerciseChartViewType": 7}})",
     1, "no name, no title of the vertical axis, no unit"},
    {"long-line",
     R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "You walked to the old town, through the park along the river, over the bridge and back on the other side of the valley, and on your way you passed the mill, the church and the school, and you rested on the market square for a while"}},
        {"class": "Label", "set": {"frame": {"rect": [0, 30, 90, 20]}, "text": "You walked to the old town, through the park along the river, over the bridge and back"}})",
     1, "seconds to say"},
};

std::string screenWith(const std::string& parts) {
  return R"({"format": "axvelto-scene/1", "names": ["Ada"], "environment": {"now": "2026-03-08T09:00:00"},
             "screen": {"class": "View", "set": {"frame": {"rect": [0, 0, 300, 600]}}, "subviews": [)" +
         parts + "]}}";
}

class AuditCommandTest : public ProgramTest {
 protected:
  Json findings(const std::string& arguments, const std::string& screen, int code) const {
    const Outcome outcome = run("audit - --json " + arguments, screen);
    EXPECT_EQ(outcome.code, code) << outcome.err;
    return Json::parse(outcome.out)["findings"];
  }
};

TEST_F(AuditCommandTest, FindsTheFaultOfEachRuleAndNoOther) {
  for (const FaultyScreen& faulty : faultyScreens) {
    const bool isWarning = std::set<std::string>{"other-words", "long-line"}.contains(faulty.rule);
    const Json found = findings("", screenWith(faulty.parts), isWarning ? 0 : 1);
    EXPECT_EQ(found.size(), faulty.count) << faulty.rule << found;
    for (const Json& finding : found) EXPECT_EQ(finding["rule"], faulty.rule) << finding;
    ASSERT_FALSE(found.empty()) << faulty.rule;
    EXPECT_NE(found[0]["what"].get<std::string>().find(faulty.what), std::string::npos) << found[0];
  }
}

TEST_F(AuditCommandTest, FallsShortForErrorsAlone) {
  EXPECT_EQ(run("audit -", screenWith(faultyScreens[0].parts)).code, 1);
  EXPECT_EQ(run("audit -", screenWith(faultyScreens[1].parts)).code, 0);
  EXPECT_EQ(run("audit - --without unspoken-text", screenWith(faultyScreens[0].parts)).code, 0);
  EXPECT_EQ(run("audit - --without everything", screenWith("")).code, 2);
  EXPECT_EQ(run("audit").code, 2);
}

TEST_F(AuditCommandTest, TellsForeignTextsFromNamesAndSharedWords) {
  const std::string screen = screenWith(
      R"({"class": "Label", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "Log out"}},
         {"class": "Label", "set": {"frame": {"rect": [0, 30, 90, 20]}, "text": "Ada"}},
         {"class": "Label", "set": {"frame": {"rect": [0, 60, 90, 20]}, "text": {"localized": "figure.distance"}}})");
  for (const Json& finding : findings("--locale all", screen, 1)) {
    EXPECT_EQ(finding["rule"], "untranslated") << finding;
    EXPECT_NE(finding["what"].get<std::string>().find("Log out"), std::string::npos) << finding;
  }
  EXPECT_TRUE(findings("", screen, 0).empty());
}

TEST_F(AuditCommandTest, ReadsRowsInTheDirectionOfTheLanguage) {
  const std::string row = screenWith(
      R"({"class": "View", "set": {"frame": {"rect": [0, 0, 300, 100]},
                                   "accessibilityElements": [{"ref": "left"}, {"ref": "right"}]}, "subviews": [
         {"class": "Label", "id": "left", "set": {"frame": {"rect": [0, 0, 90, 20]}, "text": "١"}},
         {"class": "Label", "id": "right", "set": {"frame": {"rect": [100, 0, 90, 20]}, "text": "٢"}}]})");
  EXPECT_TRUE(findings("", row, 0).empty());
  EXPECT_TRUE(findings("--locale ar_EG", row, 0).empty());
  std::string arabic = row;
  arabic.replace(arabic.find(R"({"now")"), 1, R"({"locale": "ar_EG", )");
  EXPECT_EQ(findings("", arabic, 1)[0]["rule"], "order");
}

}  // namespace

}  // namespace ax::app
