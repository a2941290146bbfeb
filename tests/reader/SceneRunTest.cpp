#include <gtest/gtest.h>

#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/ScriptedAnswers.h"
#include "tests/reader/SceneProbe.h"

namespace ax::reader {
namespace {

using Json = nlohmann::ordered_json;

using Replies = std::vector<std::string>;

Replies repliesOf(SceneRun& run) {
  const Json document = run.runSteps();
  Replies replies;
  for (const Json& result : document["results"]) replies.push_back(result["reply"].dump());
  return replies;
}

// The replies to the steps of a scene, in order.
Replies repliesOf(std::string_view members) {
  StandingScene standing(members);
  return repliesOf(standing.run);
}

TEST(SceneRunTest, ValuesReturnAsTheyAreWritten) {
  const std::vector<std::pair<std::string, std::string>> values = {
      {"null", "null"},
      {"true", "true"},
      {"-7", "-7"},
      {"2.5", "2.5"},
      {"\"a\"", "\"a\""},
      {"[1, [\"b\"]]", "[1,[\"b\"]]"},
      {R"({"number": 0.1, "as": "float"})", "0.1"},
      {R"({"number": 18446744073709551615, "as": "uint"})", "18446744073709551615"},
      {R"({"number": "nan", "as": "double"})", "\"nan\""},
      {R"({"number": "-inf", "as": "float"})", "\"-inf\""},
      {R"({"date": "2026-03-08T14:30:00"})", R"({"date":"2026-03-08T14:30:00-04:00"})"},
      {R"({"date": "2026-03-08T14:30:00Z"})", R"({"date":"2026-03-08T10:30:00-04:00"})"},
      {R"({"interval": ["2026-03-07", "2026-03-08"]})",
       R"({"interval":["2026-03-07T00:00:00-05:00","2026-03-08T00:00:00-05:00"]})"},
      {R"({"point": [1, 2.5]})", R"({"point":[1.0,2.5]})"},
      {R"({"rect": [1, 2, 3, 4]})", R"({"rect":[1.0,2.0,3.0,4.0]})"},
      {R"({"quantity": ["inf", "count/min"]})", R"({"quantity":["inf","count/min"]})"},
      {R"({"unit": "kcal"})", R"({"unit":"kcal"})"},
      {R"({"string": "km", "label": "kilometers"})", "\"km\""},
      {R"({"localized": "unit.km"})", "\"km\""},
      {R"({"localized": "split.number", "with": [{"number": 3, "as": "int"}]})", "\"Split 3\""},
      {R"({"selector": "log"})", R"({"selector":"log"})"},
      {R"({"class": "NavigationItem", "id": "n"})", R"({"id":"n","class":"NavigationItem"})"},
  };
  for (const auto& [written, reply] : values) {
    EXPECT_EQ(repliesOf(R"("environment": {"timeZone": "America/New_York"},
        "objects": [{"class": "Tests.SceneProbe", "id": "p", "set": {"_anything": )" +
                        written + R"(}}], "steps": [{"read": "_anything", "of": "p"}])"),
              Replies{reply})
        << written;
  }
}

TEST(SceneRunTest, TextsCarryTheirSpokenForms) {
  EXPECT_EQ(repliesOf(R"("environment": {"locale": "de_DE"}, "objects": [
      {"class": "Label", "id": "a", "set": {"text": {"localized": "unit.km"}}},
      {"class": "Label", "id": "b", "set": {"attributedText": {"attributed": "0:42", "label": "42 Sekunden"}}},
      {"class": "Label", "id": "c", "set": {"text": {"string": "x", "label": {"localized": "unit.mi.spoken"}}}}],
      "steps": [{"ask": "accessibilityLabel", "of": "a"}, {"ask": "accessibilityLabel", "of": "b"},
                {"ask": "accessibilityLabel", "of": "c"}, {"ask": "attributedText", "of": "b"}])"),
            (Replies{"\"Kilometer\"", "\"42 Sekunden\"", "\"Meilen\"",
                     R"({"id":null,"class":"AttributedString","attributed":"0:42","label":"42 Sekunden"})"}));
}

TEST(SceneRunTest, ReferencesReachWhatStandsLaterAndWhatIsHeldWeakly) {
  const Replies replies = repliesOf(R"("objects": [
      {"class": "Tests.SceneProbe", "id": "first",
       "set": {"_partner": {"ref": "second"}, "_weakly": {"class": "Label", "id": "inner"}}},
      {"class": "Label", "id": "second", "answers": {"accessibilityContainer": {"ref": "second"}}}],
      "steps": [{"read": "_partner", "of": "first", "as": "found"}, {"same": ["found", "second"]},
                {"read": "_weakly", "of": "first", "as": "held"}, {"same": ["held", "inner"]},
                {"ask": "accessibilityContainer", "of": "second", "as": "itself"}, {"same": ["itself", "second"]},
                {"same": ["first", "second"]}])");
  EXPECT_EQ((Replies{replies[1], replies[3], replies[5], replies[6]}),
            (Replies{"true", "true", "true", "false"}));
}

TEST(SceneRunTest, AnswersAreScripted) {
  EXPECT_EQ(repliesOf(R"("screen": {"class": "Tests.SceneProbe", "id": "p", "answers": {
      "isReady": true, "note": {"raises": "no note"}, "valueAt:for:": {"indexed": [10, {"raises": "no second"}, 30]}}},
      "objects": [{"class": "Tests.SceneProbe", "id": "other"}],
      "steps": [{"ask": "isReady", "of": "p"}, {"ask": "note", "of": "p"}, {"read": "note", "of": "p"},
                {"ask": "valueAt:for:", "of": "p", "with": [2, "x"]}, {"ask": "valueAt:for:", "of": "p", "with": [1, "x"]},
                {"ask": "valueAt:for:", "of": "p", "with": [3, "x"]}, {"ask": "valueAt:for:", "of": "p", "with": [-1, null]},
                {"ask": "valueAt:for:", "of": "other", "with": [3, "x"]}, {"ask": "isReady", "of": "other"}])"),
            (Replies{"true", R"({"raised":"no note"})", "null", "30", R"({"raised":"no second"})",
                     R"({"raised":"no reply for 3"})", R"({"raised":"no reply for -1"})", "-3", "false"}));
}

TEST(SceneRunTest, TheScreenIsPresentedOnceAndObjectsAreLeftAlone) {
  StandingScene standing(R"("screen": {"class": "Tests.SceneProbe", "id": "outer",
        "answers": {"_accessibilityLoadAccessibilityInformation": {"raises": "not today"}},
        "subviews": [{"class": "Tests.SceneProbe", "id": "inner"}]},
      "objects": [{"class": "Tests.SceneProbe", "id": "alone"}],
      "steps": [{"ask": "log", "of": "outer"}, {"ask": "log", "of": "inner"}, {"ask": "log", "of": "alone"},
                {"send": "layoutSubviews", "of": "alone"}, {"ask": "log", "of": "alone"}])");
  EXPECT_EQ(
      standing.run.hostFaults(),
      std::vector<std::string>{"Tests.SceneProbe _accessibilityLoadAccessibilityInformation: not today"});
  EXPECT_EQ(standing.run.runSteps()["results"].dump(),
            R"([{"step":0,"ask":"log","reply":"layout "},{"step":1,"ask":"log","reply":"layout load "},)"
            R"({"step":2,"ask":"log","reply":""},{"step":3,"send":"layoutSubviews","reply":null},)"
            R"({"step":4,"ask":"log","reply":"layout "}])");
}

TEST(SceneRunTest, AControllerLoadsItsViewAndPresentsIt) {
  EXPECT_EQ(repliesOf(R"("screen": {"class": "ViewController", "id": "c", "set": {"view":
        {"class": "Tests.SceneProbe", "id": "v"}}}, "steps": [{"ask": "log", "of": "v"}])"),
            Replies{"\"layout load \""});
}

TEST(SceneRunTest, StepsChangeWhatLaterStepsSee) {
  EXPECT_EQ(
      repliesOf(
          R"("environment": {"now": "2026-03-08T09:00:00", "timeZone": "Asia/Tokyo", "firstName": "Ada"},
      "objects": [{"class": "Label", "id": "l"}, {"class": "Tests.SceneProbe", "id": "p"}],
      "steps": [{"set": {"text": "new"}, "on": "l"}, {"ask": "accessibilityLabel", "of": "l", "as": "spoken"},
                {"environment": {"timeZone": "UTC"}},
                {"set": {"_anything": {"date": "2026-03-08T00:00:00"}}, "on": "p"}, {"read": "_anything", "of": "p"},
                {"set": {"note": ""}, "on": "p"}, {"ask": "fail", "of": "p"},
                {"ask": "accessibilityLabel", "of": "spoken"}])"),
      (Replies{"\"new\"", R"({"date":"2026-03-08T00:00:00+00:00"})", R"({"raised":"an empty note"})",
               R"({"raised":"out of order"})", "null"}));
  EXPECT_EQ(environment().now, 1772928000);  // 2026-03-08 00:00 UTC, nine in the morning in Tokyo
  EXPECT_EQ(environment().firstName, "Ada");
}

TEST(SceneRunTest, ShownObjectsAnswerWithTheirProperties) {
  EXPECT_EQ(
      repliesOf(R"("screen": {"class": "View", "set": {"frame": {"rect": [10, 20, 300, 400]}}, "subviews": [
        {"class": "Button", "id": "b", "set": {"title": "Start", "enabled": false, "frame": {"rect": [1, 2, 3, 4]},
         "accessibilityHint": "Starts a workout"}}]}, "steps": [{"ask": "subviews", "of": "b", "as": "none"},
        {"ask": "accessibilityElements", "of": "b", "as": "nil"}, {"ask": "accessibilityLabel", "of": "nil.0"},
        {"ask": "accessibilityContainer", "of": "b", "as": "parent"}, {"ask": "subviews", "of": "parent"}])")
          .back(),
      R"([{"id":"b","class":"Button","label":"Start","value":null,"hint":"Starts a workout",)"
      R"("traits":["button","notEnabled"],"frame":[11.0,22.0,3.0,4.0],"isElement":true}])");
}

// A host class whose members are taken away.
class Frail : public View {
 public:
  static Class& staticClass();
  void setTitle(Ref<String> title) { title_ = std::move(title); }
  Ref<String> detail() const { return title_; }
  static Ref<String> motto() { return string("all"); }

 private:
  Ref<String> title_;
};

Class& Frail::staticClass() {
  static Class& result = ClassBuilder<Frail>("Tests.Frail", View::staticClass())
                             .instanceVariable<&Frail::title_>("_title")
                             .method<&Frail::setTitle>("setTitle:")
                             .method<&Frail::detail>("detail")
                             .classMethod<&Frail::motto>("motto")
                             .conformsTo("Breakable")
                             .build();
  return result;
}

const RegisteredClass<Frail> registeredFrail;

TEST(SceneRunTest, AHostWithoutMembersStillCarriesTheScene) {
  StandingScene standing(
      R"("host": {"without": ["Tests.Frail._title", "Tests.Frail.setTitle:", "Tests.Frail.motto",
                              "Tests.Frail.Breakable", "Tests.Frail"]},
      "screen": {"class": "Tests.Frail", "id": "f", "set": {"_title": "kept", "title": "not set"},
                 "answers": {"detail": "scripted"}},
      "objects": [{"class": "Tests.Frail", "id": "g", "set": {"_title": "kept"}}],
      "steps": [{"read": "_title", "of": "f"}, {"ask": "detail", "of": "f"}, {"ask": "detail", "of": "g"},
                {"ask": "motto", "of": "Tests.Frail"}])",
      {.without = {"Tests.Frail.detail"}});
  EXPECT_EQ(repliesOf(standing.run), (Replies{"null", "null", "null", "null"}));
  EXPECT_FALSE(Frail::staticClass().conformsTo("Breakable"));
  EXPECT_EQ(Class::named("Tests.Frail"), nullptr);
  const Ref<Object> kept = standing.run.objectWithId("g");
  ASSERT_TRUE(kept);
  EXPECT_EQ(cast<Frail>(kept)->detail()->text(), "kept");
}

TEST(SceneRunTest, AHostThatKeepsNoDaysIsNotedAndStopsNothing) {
  Class& cache = *Class::named("ActivitySummaryCache");
  const Ref<Object> shared = cache.safeValueForKey("sharedInstance");
  const auto answer = [&](const ScriptedAnswer& given) {
    ASSERT_TRUE(setScriptedAnswer(cache, Selector::find("sharedInstance"), given));
  };
  answer([](auto) -> Ref<Object> { throw std::runtime_error("no room"); });
  const StandingScene standing(R"("days": {"2026-03-07": {"move": 1}}, "screen": {"class": "View"})");
  answer([shared](auto) { return shared; });
  EXPECT_EQ(standing.run.hostFaults(), Replies{"ActivitySummaryCache, keeping a day: no room"});
  EXPECT_NE(standing.run.screen(), nullptr);
}

TEST(SceneRunTest, LetsGoOfObjectsThatHoldThemselves) {
  Weak<Object> listed, own, answered;
  {
    const StandingScene standing(R"("objects": [
        {"class": "View", "id": "l", "set": {"accessibilityElements": [{"ref": "l"}]}},
        {"class": "Tests.SceneProbe", "id": "o", "set": {"_anything": {"ref": "o"}}},
        {"class": "View", "id": "a", "answers": {"accessibilityElements": [{"ref": "a"}]}}])");
    listed = standing.run.objectWithId("l");
    own = standing.run.objectWithId("o");
    answered = standing.run.objectWithId("a");
    EXPECT_TRUE(listed && own && answered);
  }
  EXPECT_EQ(listed.lock(), nullptr);
  EXPECT_EQ(own.lock(), nullptr);
  EXPECT_EQ(answered.lock(), nullptr);
}

}  // namespace
}  // namespace ax::reader
