#include <gtest/gtest.h>

#include <chrono>

#include "host/core/HostApp.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/toolkit/Label.h"
#include "tests/reader/SceneProbe.h"
#include "tests/tour/Samples.h"

namespace ax::reader {
namespace {

using Json = nlohmann::ordered_json;
using Replies = std::vector<std::string>;

Replies repliesOf(std::string_view members, const SceneRunOptions& options = {}) {
  StandingScene standing(members, options);
  Replies replies;
  const Json document = standing.run.runSteps();
  for (const Json& result : document["results"]) replies.push_back(result["reply"].dump());
  return replies;
}

// Two labels in a view, and a probe beside them.
std::string withSteps(const std::string& steps) {
  return R"("screen": {"class": "View", "id": "v", "subviews": [
        {"class": "Label", "id": "one", "set": {"text": "1"}},
        {"class": "View", "id": "two", "subviews": [{"class": "Label", "set": {"text": "2"}}]}]},
      "objects": [{"class": "Tests.SceneProbe", "id": "p"}], "steps": [)" +
         steps + "]";
}

TEST(SceneStepTest, ResultsAreTargetsAndSoAreTheirItems) {
  const Replies replies = repliesOf(withSteps(R"(
      {"ask": "subviews", "of": "v", "as": "all"}, {"same": ["all.0", "one"]}, {"same": ["all.1", "two"]},
      {"ask": "subviews", "of": "all.1", "as": "inner"}, {"read": "text", "of": "inner.0"},
      {"set": {"text": "changed"}, "on": "inner.0"}, {"read": "text", "of": "inner.0"},
      {"set": {"_anything": [[{"ref": "one"}], [{"ref": "inner.0"}, {"ref": "two"}]]}, "on": "p"},
      {"read": "_anything", "of": "p", "as": "nested"}, {"same": ["nested.1.0", "inner.0"]},
      {"same": ["nested.0.0", "nested.1.1"]}, {"same": ["nested.0.0", "one"]})"));
  ASSERT_EQ(replies.size(), 10u);
  EXPECT_EQ((Replies{replies[1], replies[2], replies[4], replies[5]}),
            (Replies{"true", "true", "\"2\"", "\"changed\""}));
  EXPECT_EQ((Replies{replies[7], replies[8], replies[9]}), (Replies{"true", "false", "true"}));
}

// The module's classes are known once it is open, and what a scene reads need not be there.
TEST(SceneStepTest, AsksThePrincipalClassAndReadsWhatThereIsNot) {
  host::linkHost();
  const std::string scene = R"("objects": [{"class": "Label", "id": "label"}], "steps": [
      {"same": ["AXVeltoGlue", "AXVeltoGlue"]}, {"ask": "accessibilityBundles", "of": "AXVeltoGlue"},
      {"read": "_leap", "of": "AXVeltoGlue"}, {"read": "_leap", "of": "label"}, {"read": "text", "of": "label"}])";
  EXPECT_EQ(repliesOf(scene, {.modulePath = tour::modulePath()}),
            (Replies{"true", "null", "null", "null", "null"}));
}

// A raised result is nil, and a nil target answers nil to everything.
TEST(SceneStepTest, NothingComesOfNil) {
  EXPECT_EQ(
      repliesOf(withSteps(R"(
      {"ask": "fail", "of": "p", "as": "raised"}, {"ask": "anything at all", "of": "raised"},
      {"read": "_partner", "of": "p", "as": "nil"}, {"read": "text", "of": "nil"}, {"ask": "log", "of": "nil.3.1"},
      {"set": {"nonsense": 1}, "on": "nil"}, {"same": ["nil", "raised"]}, {"same": ["nil", "p"]},
      {"set": {"_partner": {"ref": "nil"}}, "on": "p"}, {"read": "_partner", "of": "p"})")),
      (Replies{R"({"raised":"out of order"})", "null", "null", "null", "null", "true", "false", "null"}));
}

TEST(SceneStepTest, FaultsOfTheRunPointAtTheStep) {
  const std::string bound = R"({"ask": "subviews", "of": "v", "as": "all"}, )";
  const std::tuple<std::string, std::string, std::string> faults[] = {
      {R"({"ask": "subviews", "of": "all.2"})", "/steps/1/of", "no item \"all.2\" in a list of 2"},
      {R"({"same": ["one", "all.0.0"]})", "/steps/1/same/1", "no list for \"all.0.0\""},
      {R"({"ask": "note", "of": "all.0"})", "/steps/1", "a method of an object of class Label"},
      {R"({"ask": "note", "of": "Label"})", "/steps/1", "a method of the class"},
      {R"({"set": {"text": "ok", "colour": 1}, "on": "all.0"})", "/steps/1/set/colour", "unknown member"},
      {R"({"set": {"text": 5}, "on": "all.0"})", "/steps/1/set/text", "a value of class Number for text"},
      {R"({"set": {"_anything": [1, [{"ref": "all.9"}]]}, "on": "p"})", "/steps/1/set/_anything/1/0",
       "all.9"},
      {R"({"set": {"_anything": [1, [null]]}, "on": "p"})", "/steps/1/set/_anything/1/0", "null in a list"},
      {R"({"ask": "valueAt:for:", "of": "p", "with": [1]})", "/steps/1", "1 values for valueAt:for:"},
      {R"({"ask": "valueAt:for:", "of": "p", "with": [1.5, "x"]})", "/steps/1/with/0", "a whole number"},
      {R"({"call": "CHCacheIndexForDate", "with": [null]})", "/steps/1", "a bundle that exports it"},
      {R"({"set": {"_partner": {"class": "Label", "set": {"text": {"localized": "no.such"}}}}, "on": "p"})",
       "/steps/1/set/_partner/set/text", "unknown text"},
  };
  for (const auto& [step, place, told] : faults) {
    const Fault fault = faultOf(sceneText(withSteps(bound + step)));
    EXPECT_EQ(fault.place, place) << step << "\n" << fault.text();
    EXPECT_NE(fault.text().find(told), std::string::npos) << step << "\n" << fault.text();
  }
}

TEST(SceneStepTest, StepsBeforeAFaultAreDone) {
  StandingScene standing(withSteps(
      R"({"set": {"text": "done"}, "on": "one"}, {"set": {"text": "too", "hidden": 3}, "on": "one"})"));
  EXPECT_THROW(standing.run.runSteps(), Fault);
  EXPECT_EQ(cast<Label>(standing.run.objectWithId("one"))->text()->text(), "too");
}

TEST(SceneStepTest, IndexedRepliesEndAtBothEnds) {
  const std::string probe =
      R"("objects": [{"class": "Tests.SceneProbe", "id": "p", "answers": {"valueAt:for:":
      {"indexed": [5, {"raises": "broken"}]}}}, {"class": "Tests.SceneProbe", "id": "none",
      "answers": {"valueAt:for:": {"indexed": []}, "note": null}}], "steps": [)";
  const std::string raised = R"({"raised":"no reply for )";
  EXPECT_EQ(repliesOf(probe + R"({"ask": "valueAt:for:", "of": "p", "with": [0, null]},
          {"ask": "valueAt:for:", "of": "p", "with": [2, null]},
          {"ask": "valueAt:for:", "of": "p", "with": [9223372036854775807, null]},
          {"ask": "valueAt:for:", "of": "p", "with": [-9223372036854775808, null]},
          {"ask": "valueAt:for:", "of": "none", "with": [0, null]}, {"read": "note", "of": "none"}])"),
            (Replies{"5", raised + "2\"}", raised + "9223372036854775807\"}",
                     raised + "-9223372036854775808\"}", raised + "0\"}", "null"}));
}

TEST(SceneStepTest, EnvironmentsAddUp) {
  StandingScene standing(R"("environment": {"locale": "de_DE", "timeZone": "Asia/Tokyo",
        "now": "2026-03-08T09:00:00", "wheelchair": "yes", "firstDayOfWeek": 2, "energyUnit": "kJ"}, "steps": [
      {"environment": {}}, {"environment": {"timeZone": "America/New_York", "screenReader": false}},
      {"environment": {"now": "2026-03-08T02:30:00", "locale": "ar_EG", "wheelchair": "error"}}])");
  EXPECT_EQ(environment().now, 1772928000);
  EXPECT_EQ(standing.run.runSteps()["results"].dump(), "[]");
  EXPECT_EQ(environment().now, 1772955000) << "03:30 in New York, where clocks skip 02:30";
  EXPECT_EQ(environment().locale, "ar_EG");
  EXPECT_EQ(environment().wheelchair, WheelchairUse::error);
  EXPECT_EQ(environment().energyUnit, "kJ");
  EXPECT_EQ(environment().firstDayOfWeek, 2);
  EXPECT_FALSE(environment().screenReader);
  const StandingScene next("");
  EXPECT_EQ(environment().locale, Environment().locale) << "nothing stays for the next scene";
  EXPECT_EQ(environment().wheelchair, Environment().wheelchair);
}

// The rings of a day belong to the calendar day of whoever looks, from its first second to its last.
TEST(SceneDaysTest, AreThoseOfTheLocalCalendar) {
  host::linkHost();
  using namespace std::chrono;
  const auto index = sys_days(2026y / March / 8).time_since_epoch().count();
  for (const char* zone : {"Pacific/Kiritimati", "Pacific/Pago_Pago", "America/New_York", "Asia/Kathmandu"}) {
    const Replies replies = repliesOf(R"("environment": {"timeZone": ")" + std::string(zone) +
                                          R"("}, "days": {"2026-03-08": {"move": 0.75}},
        "steps": [{"ask": "sharedInstance", "of": "ActivitySummaryCache", "as": "days"},
          {"call": "CHCacheIndexForDate", "with": [{"date": "2026-03-08T00:00:00"}]},
          {"call": "CHCacheIndexForDate", "with": [{"date": "2026-03-08T23:59:59"}]},
          {"call": "CHCacheIndexForDate", "with": [{"date": "2026-03-09T00:00:00"}]},
          {"ask": "activitySummaryForCacheIndex:", "of": "days", "with": [)" +
                                          std::to_string(index) + R"(], "as": "day"},
          {"ask": "_activeEnergyCompletionPercentage", "of": "day"},
          {"ask": "_standHoursCompletionPercentage", "of": "day"}])",
                                      {.modulePath = tour::modulePath()});
    ASSERT_EQ(replies.size(), 7u);
    EXPECT_EQ(
        (Replies{replies[1], replies[2], replies[3], replies[5], replies[6]}),
        (Replies{std::to_string(index), std::to_string(index), std::to_string(index + 1), "0.75", "0.0"}))
        << zone;
  }
}

class DottedBase : public View {
 public:
  static Class& staticClass();
  Ref<String> inherited() const { return string("of the base"); }
  std::int64_t countAt(std::int64_t index, Ref<String>) { return index; }
};

class DottedLeaf : public DottedBase {
 public:
  static Class& staticClass();
  Ref<String> own() const { return string("of the leaf"); }
  Ref<Object> held_;
};

Class& DottedBase::staticClass() {
  static Class& result = ClassBuilder<DottedBase>("Tests.Dotted.Base", View::staticClass())
                             .method<&DottedBase::inherited>("inherited")
                             .method<&DottedBase::countAt>("countAt:for:")
                             .build();
  return result;
}

Class& DottedLeaf::staticClass() {
  static Class& result = ClassBuilder<DottedLeaf>("Tests.Dotted.Leaf", DottedBase::staticClass())
                             .instanceVariable<&DottedLeaf::held_>("_held")
                             .method<&DottedLeaf::own>("own")
                             .build();
  return result;
}

const RegisteredClass<DottedBase> registeredBase;
const RegisteredClass<DottedLeaf> registeredLeaf;

// Names with dots in them, members of classes above, names with blanks, and one name twice.
TEST(SceneOmissionsTest, AreFoundUnderEveryKindOfName) {
  const std::string rest = R"("objects": [{"class": "Tests.Dotted.Leaf", "id": "leaf", "set": {"_held": "x"}},
        {"class": "Tests.Dotted.Base", "id": "base"}], "steps": [
        {"ask": "own", "of": "leaf"}, {"read": "_held", "of": "leaf"}, {"ask": "inherited", "of": "leaf"},
        {"ask": "countAt:for:", "of": "leaf", "with": [3, null]}, {"ask": "inherited", "of": "base"}])";
  EXPECT_EQ(repliesOf(rest),
            (Replies{"\"of the leaf\"", "\"x\"", "\"of the base\"", "3", "\"of the base\""}));
  EXPECT_EQ(repliesOf(R"("host": {"without": ["Tests.Dotted.Leaf._held", "Tests.Dotted.Leaf._held",
        "Tests.Dotted.Base.countAt: for:"]}, )" +
                      rest),
            (Replies{"\"of the leaf\"", "null", "\"of the base\"", "null", "\"of the base\""}));
  EXPECT_EQ(repliesOf(rest, {.without = {"Tests.Dotted.Leaf.inherited", "Tests.Dotted.Leaf"}}),
            (Replies{"\"of the leaf\"", "null", "null", "null", "null"}));
  EXPECT_EQ(Class::named("Tests.Dotted.Leaf"), nullptr);
  EXPECT_NE(Class::named("Tests.Dotted.Base"), nullptr);
  EXPECT_THROW(StandingScene(rest, {.without = {"Tests.Dotted.Leaf.leap"}}), Fault);
  EXPECT_THROW(StandingScene(rest, {.without = {"Tests.Dotted"}}), Fault);
}

}  // namespace
}  // namespace ax::reader
