#include "reader/scene/Expectation.h"

#include <gtest/gtest.h>

#include "reader/scene/SceneText.h"
#include "reader/text/Fault.h"

namespace ax::reader {

namespace {

using Json = nlohmann::ordered_json;

std::string differing(const char* expected, const char* found) {
  std::string places;
  for (const Difference& difference : differences(Json::parse(expected), Json::parse(found), "/at")) {
    places += (places.empty() ? "" : " ") + difference.place + (difference.expected ? "" : "+") +
              (difference.found ? "" : "-");
  }
  return places;
}

TEST(ExpectationTest, LeavesMembersOutButNothingElse) {
  EXPECT_EQ(differing(R"({"a": 1})", R"({"a": 1.0, "b": 2})"), "");
  EXPECT_EQ(differing(R"({"a": 1, "c/d": null})", R"({"a": 1})"), "/at/c~1d-");
  EXPECT_EQ(differing("[1, 2]", "[1, 3, 4]"), "/at/1 /at/2+");
  EXPECT_EQ(differing(R"([{"a": 1}, 5])", R"([{"a": "1"}])"), "/at/0/a /at/1-");
  EXPECT_EQ(differing("null", "0"), "/at");
  EXPECT_EQ(differing("{}", "[]"), "/at");
}

TEST(ExpectationTest, IsAcceptedWithoutWhatItLeavesOut) {
  const auto acceptedText = [](const char* expected, const char* found) {
    return accepted(Json::parse(expected), Json::parse(found)).dump();
  };
  EXPECT_EQ(acceptedText(R"({"b": 1, "gone": 2})", R"({"a": 0, "b": 7})"), R"({"b":7})");
  EXPECT_EQ(acceptedText(R"([{"b": 1}])", R"([{"a": 0, "b": 7}])"), R"([{"b":7}])");
  EXPECT_EQ(acceptedText(R"([{"b": 1}])", R"([{"b": 7}, 2])"), R"([{"b":7},2])");
}

TEST(SceneTextTest, ChangesOneMemberAndKeepsTheLayout) {
  const std::string scene =
      "{ \"steps\": [\n  {\"ask\": \"a\\\"]}\" , \"of\":\"x\"},\n  {\n    \"read\": \"k\"\n  }\n] }\n";
  EXPECT_EQ(
      withMember(scene, "/steps/0", "expect", "yes", "f"),
      "{ \"steps\": [\n  {\"ask\": \"a\\\"]}\" , \"of\":\"x\", \"expect\": \"yes\"},\n  {\n    \"read\": "
      "\"k\"\n  }\n] }\n");
  const std::string second = withMember(scene, "/steps/1", "expect", nullptr, "f");
  EXPECT_NE(second.find("    \"read\": \"k\",\n    \"expect\": null\n  }"), std::string::npos) << second;
  const std::string again = withMember(second, "/steps/1", "expect", {1, 2.5, 50.0}, "f");
  EXPECT_NE(again.find("\"expect\": [1, 2.5, 50]\n"), std::string::npos) << again;
  EXPECT_EQ(withMember("{}", "", "expect", 1, "f"), "{\"expect\": 1}");
}

TEST(SceneTextTest, RefusesWhatItWouldChangeBeyondTheMember) {
  const std::string escaped = "{\"st\\u0065ps\": [{\"of\": 1}]}";
  EXPECT_THROW(withMember(escaped, "/steps/0", "expect", 1, "f"), Fault);
}

TEST(SceneTextTest, BreaksLinesThatWouldGrowTooLong) {
  const std::string text = laidOut(Json::array({std::string(60, 'a'), std::string(60, 'b')}), 0, 0);
  EXPECT_EQ(text, "[\n  \"" + std::string(60, 'a') + "\",\n  \"" + std::string(60, 'b') + "\"\n]");
  Json members = Json::object();
  for (int i = 0; i < 12; ++i) members["member" + std::to_string(i)] = i;
  const std::string flowing = laidOut(members, 4, 4);
  EXPECT_EQ(std::count(flowing.begin(), flowing.end(), '\n'), 1) << flowing;
  EXPECT_EQ(Json::parse(flowing), members);
}

}  // namespace

}  // namespace ax::reader
