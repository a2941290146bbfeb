#include <gtest/gtest.h>

#include "tests/reader/SceneProbe.h"

namespace ax::reader {
namespace {

struct Malformed {
  std::string text;  // of the whole scene, or its members
  std::string place;
  std::string told;  // a part of the line
};

void expectFaults(const std::vector<Malformed>& scenes) {
  for (const Malformed& malformed : scenes) {
    const bool isWhole = malformed.text.empty() || malformed.text.front() != '"';
    const Fault fault = faultOf(isWhole ? malformed.text : sceneText(malformed.text));
    EXPECT_EQ(fault.place, malformed.place) << malformed.text << "\n" << fault.text();
    EXPECT_NE(fault.text().find(malformed.told), std::string::npos) << malformed.text << "\n" << fault.text();
    EXPECT_FALSE(fault.expected.empty()) << malformed.text;
  }
}

TEST(SceneFaultTest, JsonIsReadStrictly) {
  expectFaults({
      {"", "line 1, column 1", "unexpected end of input"},
      {"{\n \"format\": 1,,\n}", "line 2, column 14", "unexpected ','"},
      {"{\"title\": \"ü\" x}", "line 1, column 15", "invalid literal"},
      {"{\"title\": \"\xff\"}", "line 1, column 12", "ill-formed UTF-8"},
      {"{\"title\": 1e999}", "line 1, column 15", "number overflow"},
      {"{} {}", "line 1, column 4", "end of input"},
      {std::string("{\n}\0 {}", 7), "line 2, column 2", "a zero byte"},
      {"{\"a\": 1,\n\"a\": 2}", "line 2, column 3", "\"a\" twice"},
      {std::string(100000, '['), "line 1, column 101", "at most 100 levels"},
  });
  EXPECT_EQ(
      faultOf("[]").text(),
      "axvelto: test.json: a value of type array, expected an object with the keys format, title, names, "
      "environment, host, days, screen, objects, steps, expect");
}

TEST(SceneFaultTest, TheFrameIsChecked) {
  expectFaults({
      {"{}", "", "no \"format\""},
      {R"({"format": "axvelto-scene/2"})", "/format", "expected \"axvelto-scene/1\""},
      {R"("colour~/": 1)", "/colour~0~1", "unknown key \"colour~/\""},
      {R"("title": null)", "/title", "expected a string"},
      {R"("environment": {"locale": "xx_YY"})", "/environment/locale", "\"xx_YY\""},
      {R"("environment": {"timeZone": "Mars/Base"})", "/environment/timeZone", "a time zone"},
      {R"("environment": {"now": "2026-02-30T09:00:00"})", "/environment/now", "a date"},
      {R"("environment": {"wheelchair": "maybe"})", "/environment/wheelchair", "unknown, no, yes, error"},
      {R"("environment": {"firstDayOfWeek": 8})", "/environment/firstDayOfWeek", "from 1 to 7"},
      {R"("environment": {"energyUnit": "km"})", "/environment/energyUnit", "a unit of energy"},
      {R"("environment": {"checks": 1})", "/environment/checks", "true or false"},
      {R"("host": {"without": ["Nobody._x"]})", "/host/without/0", "no class for \"Nobody._x\""},
      {R"("host": {"without": ["View", "View._x"]})", "/host/without/1", "unknown member \"_x\""},
      {R"("days": {"2026-13-01": {}})", "/days/2026-13-01", "a day such as"},
      {R"("days": {"2026-03-07T00:00:00": {}})", "/days/2026-03-07T00:00:00", "a day such as"},
      {R"("days": {"2026-03-07": {"sit": 1}})", "/days/2026-03-07/sit", "move, exercise, stand"},
      {R"("objects": {})", "/objects", "a list of objects"},
  });
}

TEST(SceneFaultTest, ObjectsAreCheckedAgainstTheirClasses) {
  expectFaults({
      {R"("screen": {"id": "x"})", "/screen", "no \"class\""},
      {R"("screen": {"class": "Labell"})", "/screen/class", "unknown class \"Labell\""},
      {R"("screen": {"class": "NavigationItem"})", "/screen/class", "a view or a view controller"},
      {R"("objects": [{"class": "Unit"}])", "/objects/0/class", "a class whose objects can be made"},
      {R"("screen": {"class": "Label", "set": {"txt": "a"}})", "/screen/set/txt", "unknown member \"txt\""},
      {R"("screen": {"class": "Label", "answers": {"leap": 1}})", "/screen/answers/leap",
       "a method of class Label"},
      {R"("screen": {"class": "View", "subviews": [{"class": "Layer"}]})", "/screen/subviews/0/class",
       "a class below View"},
      {R"("objects": [{"class": "Layer", "subviews": []}])", "/objects/0/subviews", "class Layer holds none"},
      {R"("objects": [{"class": "View", "id": "a"}, {"class": "View", "id": "a"}])", "/objects/1/id",
       "taken"},
      {R"("screen": {"class": "View", "id": "a.1"})", "/screen/id", "no dot"},
      {R"("screen": {"class": "View", "id": "Label"})", "/screen/id", "the name of a class"},
      {R"("screen": {"class": "Tests.SceneProbe", "set": {"_partner": {"ref": "b"}}})",
       "/screen/set/_partner/ref", "nothing is called \"b\""},
      {R"("screen": {"class": "Tests.SceneProbe", "answers": {"isReady": {"indexed": [true]}}})",
       "/screen/answers/isReady/indexed", "whose first argument is a whole number"},
      {R"("screen": {"class": "Tests.SceneProbe", "answers": {"isReady": 1}})", "/screen/answers/isReady",
       "true or false"},
      {R"("screen": {"class": "Tests.SceneProbe", "set": {"note": ""}})", "/screen/set/note",
       "an empty note"},
  });
}

Malformed probeSetting(const std::string& key, const std::string& value, const std::string& below,
                       const std::string& told) {
  return {R"("screen": {"class": "Tests.SceneProbe", "set": {")" + key + "\": " + value + "}}",
          "/screen/set/" + key + below, told};
}

TEST(SceneFaultTest, ValuesAreOfTheKindThatTheMemberTakes) {
  expectFaults({
      probeSetting("_flag", "1", "", "true or false"),
      probeSetting("_flag", "null", "", "null for _flag"),
      probeSetting("_small", "2147483648", "", "a whole number of 32 bits"),
      probeSetting("_small", "true", "", "a whole number"),
      probeSetting("_small", "1.0", "", "a whole number"),
      probeSetting("_large", "-1", "", "not negative"),
      probeSetting("_fraction", "\"1\"", "", "a number"),
      probeSetting("_place", R"({"rect": [1, 2, 3, 4]})", "", "a point"),
      probeSetting("_partner", "\"text\"", "", "a value of class View"),
      probeSetting("_styled", "\"0:42\"", "", "a value of class AttributedString"),
      probeSetting("note", "5", "", "a value of class Number for note"),
      probeSetting("frame", R"({"point": [1, 2]})", "", "a rect"),
      probeSetting("_anything", R"({"date": "2026-03-08 14h30"})", "/date", "a date"),
      probeSetting("_anything", R"({"quantity": [1, "stone"]})", "/quantity/1", "a unit"),
      probeSetting("_anything", R"({"rect": [1, 2, 3]})", "/rect", "a list of 3"),
      probeSetting("_anything", R"({"interval": [{"date": "x"}, "y"]})", "/interval/0", "expected a string"),
      probeSetting("_anything", R"({"interval": ["2026-03-08", "2026-03-07"]})", "", "ends before it starts"),
      probeSetting("_anything", R"({"number": 3, "as": "long"})", "/as", "one of bool, int"),
      probeSetting("_anything", R"({"number": 1e300, "as": "float"})", "/number", "a float"),
      probeSetting("_anything", R"({"number": 3})", "", "no \"as\""),
      probeSetting("_anything", "9223372036854775808", "", "a whole number from"),
      probeSetting("_anything", R"({"string": "km", "spoken": "x"})", "/spoken", "string, label"),
      probeSetting("_anything", R"({"colour": "red"})", "", "an object of no known kind"),
      probeSetting("_anything", "[1, null]", "/1", "null in a list"),
      probeSetting("_anything", R"({"localized": "no.such.text"})", "", "unknown text"),
  });
}

TEST(SceneFaultTest, StepsAreChecked) {
  const std::string screen = R"("screen": {"class": "Tests.SceneProbe", "id": "p"}, "steps": )";
  expectFaults({
      {screen + R"([{"of": "p"}])", "/steps/0", "a step of no known kind"},
      {screen + R"([{"ask": "log", "on": "p"}])", "/steps/0/on", "unknown key \"on\""},
      {screen + R"([{"ask": "log", "of": "q"}])", "/steps/0/of", "nothing is called \"q\""},
      {screen + R"([{"ask": "log", "of": "later"}, {"ask": "log", "of": "p", "as": "later"}])", "/steps/0/of",
       "\"later\""},
      {screen + R"([{"ask": "log", "of": "p", "as": "p"}])", "/steps/0/as", "taken"},
      {screen + R"([{"ask": "leap", "of": "p"}])", "/steps/0", "unknown method \"leap\""},
      {screen + R"([{"same": ["p", "AXVeltoNowhere"]}])", "/steps/0/same/1",
       "nothing is called \"AXVeltoNowhere\""},
      {screen + R"([{"ask": "setNote:", "of": "p"}])", "/steps/0", "1 under \"with\""},
      {screen + R"([{"ask": "setNote:", "of": "p", "with": [1]}])", "/steps/0/with", "another class"},
      {screen + R"([{"ask": "valueAt:for:", "of": "p", "with": ["1", ""]}])", "/steps/0/with/0",
       "a whole number"},
      {screen + R"([{"set": {"txt": 1}, "on": "p"}])", "/steps/0/set/txt", "unknown member"},
      {screen + R"([{"ask": "subviews", "of": "p", "as": "s"}, {"ask": "log", "of": "s.0"}])", "/steps/1/of",
       "no item \"s.0\" in a list of 0"},
      {screen + R"([{"ask": "log", "of": "p.0"}])", "/steps/0/of", "no list"},
      {screen + R"([{"call": "leap"}])", "/steps/0/call", "accessibilityLocalizedString"},
      {screen + R"([{"call": "CHCacheIndexForDate"}])", "/steps/0", "1 under \"with\""},
      {screen + R"([{"same": ["p"]}])", "/steps/0/same", "two targets"},
      {screen + R"([{"environment": {"zone": "UTC"}}])", "/steps/0/environment/zone", "unknown key"},
  });
}

}  // namespace
}  // namespace ax::reader
