#include <nlohmann/json.hpp>
#include <set>

#include "tests/apps/ProgramTest.h"
#include "tests/bundle/StartedBundle.h"

namespace ax::app {
namespace {

using Json = nlohmann::ordered_json;

class CommandFaultsTest : public ProgramTest {
 protected:
  // The run fails with exactly this line after the program's name, and prints nothing.
  void expectRefusal(const std::string& arguments, const std::string& input, const std::string& line) const {
    const Outcome outcome = run(arguments, input);
    EXPECT_EQ(outcome.code, 2) << arguments;
    EXPECT_EQ(outcome.out, "") << arguments;
    EXPECT_EQ(outcome.err, "axvelto: " + line + "\n") << arguments;
  }
};

std::string scene(const std::string& members) {
  return R"({"format": "axvelto-scene/1")" + (members.empty() ? "" : ", " + members) + "}";
}

const std::string oneNote = scene(R"("title": "Notes", "screen": {"class": "View", "subviews": [
    {"class": "Label", "id": "note", "set": {"frame": {"rect": [0, 0, 50, 20]}, "text": "Note"}}]})");

TEST_F(CommandFaultsTest, TellWhatIsWrongWhereAndWhatWasExpected) {
  expectRefusal(
      "speak -", "{\"format\":\n 1,,}",
      "-: syntax error while parsing object key - unexpected ',', at line 2, column 4, expected string "
      "literal");
  expectRefusal(
      "tree -", scene(R"("screen": {"class": "View", "subviews": [{"class": "Lable"}]})"),
      "-: unknown class \"Lable\", at /screen/subviews/0/class, expected a class of the host or the "
      "platform");
  expectRefusal("speak -", "<kml/>",
                "-: the root element is kml, at line 1, column 2, expected TrainingCenterDatabase or gpx");
  expectRefusal("import -", oneNote, "-: a JSON text, expected a workout in FIT, TCX or GPX");
  expectRefusal("import - --locale xx_YY", "",
                "--locale: \"xx_YY\" is no known locale, expected one such as en_US");
  expectRefusal("import - --time-zone Mars/Olympus", "",
                "--time-zone: \"Mars/Olympus\" is no known time zone, expected one such as Europe/Berlin");
  expectRefusal("speak no/such.json", "",
                "no/such.json: there is no such file, expected a scene or a workout file");
  expectRefusal("check --without Label.Ring", "",
                "--without: unknown member \"Ring\", expected a member, method, class method or protocol of "
                "class Label");
  expectRefusal("check --without View.", "",
                "--without: no class for \"View.\", expected Class or Class.member");
  expectRefusal("graph - --of nobody", oneNote,
                "-: no object \"nobody\", at --of, expected an id of the scene");
}

TEST_F(CommandFaultsTest, AStepThatCannotBeTakenSpoilsTheWholeAnswer) {
  expectRefusal(
      "ask -", scene(R"("objects": [{"class": "View", "id": "v"}], "steps": [
                    {"ask": "subviews", "of": "v", "as": "s"}, {"ask": "text", "of": "s.4"}])"),
      "-: no item \"s.4\" in a list of 0, at /steps/1/of, expected a smaller index, counted from 0");
}

// Without a screen there is nothing to speak, and yet something to ask and to describe.
TEST_F(CommandFaultsTest, OnlySomeCommandsNeedAScreen) {
  for (const char* command : {"speak -", "tree -", "ask - --at 1,1", "ask - --activate x"}) {
    expectRefusal(command, scene(""), "-: no screen, at /screen, expected an object to present");
  }
  EXPECT_EQ(Json::parse(run("ask -", scene("")).out)["results"], Json::array());
  EXPECT_EQ(run("graph - --json", scene("")).out, "{\n  \"charts\": []\n}\n");
  EXPECT_EQ(run("check -", scene("")).code, 0);
}

TEST_F(CommandFaultsTest, BadUseIsToldBeforeAnyFileIsRead) {
  for (const char* arguments :
       {"speak - -", "tree - --json", "speak - --locale", "import", "import - --json", "ask - --at x,y",
        "ask - --at 1,2,3", "ask - --activate a --at 1,1", "--loud"}) {
    const Outcome outcome = run(arguments, "no scene at all");
    EXPECT_EQ(outcome.code, 2) << arguments;
    EXPECT_EQ(outcome.out, "") << arguments;
    EXPECT_TRUE(outcome.err.ends_with(" (axvelto --help tells the use)\n")) << arguments << outcome.err;
  }
  EXPECT_EQ(run("--version").out.substr(0, 8), "axvelto ");
  for (const char* arguments : {"--help", "speak --help", "ask --help"}) {
    const Outcome help = run(arguments);
    EXPECT_EQ(help.code, 0);
    EXPECT_EQ(help.err, "");
    EXPECT_NE(help.out.find("--help"), std::string::npos);
  }
}

// What the host does wrong is told beside the result, and does not take it away.
TEST_F(CommandFaultsTest, AHostThatRaisesIsToldOfAndSpeaksOn) {
  const Outcome outcome = run("speak -", scene(R"("title": "T", "screen": {"class": "View",
      "answers": {"layoutSubviews": {"raises": "no room"}}, "subviews": [
        {"class": "Label", "set": {"text": "a"}, "answers": {"accessibilityHint": {"raises": "no hint"}}}]})"));
  EXPECT_EQ(outcome.code, 0);
  EXPECT_EQ(outcome.out, "Screen: T\na\n");
  EXPECT_EQ(outcome.err,
            "axvelto: -: the host raised, in View layoutSubviews: no room\n"
            "axvelto: -: the host raised while it was asked, 1 time\n");
}

// Neither one object that raises wherever it is asked nor objects without end keep the others from speaking.
TEST_F(CommandFaultsTest, WhatTheHostDoesWrongNeverEndsACommand) {
  const std::string raising = scene(R"("title": "T", "screen": {"class": "View",
      "set": {"frame": {"rect": [0, 0, 90, 90]}}, "subviews": [
        {"class": "Label", "set": {"text": "a", "frame": {"rect": [0, 0, 90, 40]}}},
        {"class": "View", "set": {"frame": {"rect": [0, 0, 90, 40]}},
         "answers": {"accessibilityContainer": {"raises": "lost"}}}]})");
  const Outcome spoken = run("speak -", raising);
  EXPECT_EQ(spoken.code, 0);
  EXPECT_EQ(spoken.out, "Screen: T\na\n");
  EXPECT_EQ(spoken.err, "axvelto: -: the host raised while it was asked, 2 times\n");
  const Outcome touched = run("ask - --at 5,5", raising);
  EXPECT_EQ(touched.code, 0);
  EXPECT_EQ(touched.out, "a\n");

  std::string chain;
  for (int i = 0; i < 300; ++i) {
    chain += R"({"class": "View", "id": "v)" + std::to_string(i) +
             R"(", "set": {"accessibilityElements": [{"ref": "v)" + std::to_string(i + 1) + R"("}]}}, )";
  }
  const Outcome deep =
      run("speak -", scene(R"("title": "T", "objects": [)" + chain + R"({"class": "View", "id": "v300"}],
      "screen": {"class": "View", "set": {"accessibilityElements": [{"ref": "v0"}]}})"));
  EXPECT_EQ(deep.code, 0);
  EXPECT_EQ(deep.out, "Screen: T\nNothing to speak\n");
  EXPECT_EQ(deep.err,
            "axvelto: -: what lies deeper than 256 levels, or behind 100000 objects, was left out, 1 time\n");
}

// Files come from strangers: what they hold is shown and never obeyed, on one line each and not without end.
TEST_F(CommandFaultsTest, TextsOfAFileDoNotReachTheTerminalAsOrders) {
  expectRefusal(
      "speak -", scene(R"("screen": {"class": "a\u001b[2J\n\u202eb"})"),
      "-: unknown class \"a\\u001b[2J\\u000a\\u202eb\", at /screen/class, expected a class of the host or "
      "the platform");
  const std::string endless(1 << 20, 'x');
  expectRefusal(
      "speak -", scene(R"("screen": {"class": ")" + endless + "\"}"),
      "-: unknown class \"" + endless.substr(0, 985) +
          "... (1048592 characters), at /screen/class, expected a class of the host or the platform");
  const std::string ordering = scene(R"("title": "T\u009b", "screen": {"class": "View", "subviews": [
      {"class": "Label", "id": "l", "set": {"text": "a\u001b[31m\u2066b\u007f"}}]})");
  EXPECT_EQ(run("speak -", ordering).out, "Screen: T\\u009b\na\\u001b[31m\\u2066b\\u007f\n");
  const std::string tree = run("tree -", ordering).out;
  EXPECT_NE(tree.find(R"("a\u001b[31m\u2066b\u007f")"), std::string::npos) << tree;
  EXPECT_EQ(Json::parse(tree)["elements"][0]["label"], "a\u001b[31m\u2066b\u007f");
  EXPECT_EQ(run("'sp\u001beak\n'").err,
            "axvelto: unknown command \"sp\\u001beak\\u000a\" (axvelto --help tells the use)\n");
}

TEST_F(CommandFaultsTest, AnActionThatCannotBeDoneFallsShort) {
  const Outcome none = run("ask - --activate note", oneNote);
  EXPECT_EQ(none.code, 1);
  EXPECT_EQ(none.err, "axvelto: -: no activate of \"note\", expected an element that can be operated\n");
  const Outcome raising = run("ask - --activate b", scene(R"("screen": {"class": "View", "subviews": [
      {"class": "Button", "id": "b", "set": {"title": "B"}, "answers": {"accessibilityActivate": {"raises": "x"}}},
      {"class": "Button", "id": "idle", "set": {"title": "C"}, "answers": {"accessibilityActivate": false}}]})"));
  EXPECT_EQ(raising.code, 1);
  EXPECT_EQ(raising.err, "axvelto: -: the host raised in activate of \"b\", expected an answer\n");
}

// Every part of a tree is whole: the elements of it are what is spoken, whatever the language.
TEST_F(CommandFaultsTest, EverySampleIsSoundJsonInEveryForm) {
  for (const auto& entry : std::filesystem::directory_iterator(sample(""))) {
    if (entry.path().extension() != ".json") continue;
    const std::string name = "'" + entry.path().string() + "'";
    for (const std::string& arguments :
         {"tree " + name + " --locale ja_JP", "graph " + name + " --json", "ask " + name}) {
      const Outcome outcome = run(arguments);
      EXPECT_EQ(outcome.code, 0) << arguments;
      EXPECT_EQ(outcome.err, "") << arguments;
      EXPECT_TRUE(Json::accept(outcome.out)) << arguments;
    }
  }
}

// The screens at risk are those of the failed checks, and the text tells the same as the JSON.
TEST_F(CommandFaultsTest, AReportOfTheContractAddsUp) {
  const std::string without =
      "check --without LoadingView --without CHFriendDetailGoalCell --without "
      "ActivitySummaryCache.activitySummaryForCacheIndex:";
  const Outcome outcome = run(without + " --json");
  EXPECT_EQ(outcome.code, 1);
  const Json report = Json::parse(outcome.out);
  std::set<std::string> checks, atRisk;
  std::size_t failed = 0;
  for (const Json& check : report["checks"]) {
    EXPECT_TRUE(checks.insert(check["check"]).second) << check << " twice";
    EXPECT_EQ(check["passed"] == true, check["found"] == check["expected"]) << check;
    if (check["passed"] == true) continue;
    ++failed;
    atRisk.insert(check["screens"].begin(), check["screens"].end());
  }
  EXPECT_GE(failed, 1u);
  const std::set<std::string> told(report["screensAtRisk"].begin(), report["screensAtRisk"].end());
  EXPECT_EQ(told, atRisk);
  const std::string text = run(without).out;
  EXPECT_NE(text.find(std::to_string(checks.size() - failed) + " checks passed, " + std::to_string(failed) +
                      " failed; " + report["installed"].dump() + " of " + std::to_string(categoryCount()) +
                      " categories installed"),
            std::string::npos);
}

}  // namespace
}  // namespace ax::app
