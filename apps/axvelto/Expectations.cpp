#include "apps/axvelto/Expectations.h"

#include <fstream>

#include "apps/shared/Complaint.h"
#include "apps/shared/Input.h"
#include "reader/graph/ChartDescription.h"
#include "reader/scene/Expectation.h"
#include "reader/scene/SceneText.h"
#include "reader/snapshot/Charts.h"
#include "reader/transcript/Transcript.h"
#include "reader/transcript/TreeJson.h"

namespace ax::app {

namespace {

using Json = nlohmann::ordered_json;
using reader::Difference;
using reader::Scene;
using reader::Snapshot;

Json spoken(const Snapshot& snapshot, const std::string& title) {
  return reader::transcript(snapshot, title);
}

Json tree(const Snapshot& snapshot, const std::string&) {
  return reader::treeAsJson(snapshot);
}

Json graph(const Snapshot& snapshot, const std::string&) {
  Json charts = Json::array();
  for (const reader::Node* chart : reader::charts(snapshot)) {
    charts.push_back(reader::chartAsJson(snapshot, *chart));
  }
  return charts;
}

// What a scene may expect of its screen as it is presented.
struct ScreenReading {
  const char* key;
  Json (*read)(const Snapshot& snapshot, const std::string& title);
};
constexpr ScreenReading screenReadings[] = {{"speak", spoken}, {"tree", tree}, {"graph", graph}};
constexpr const char* reportKeys[] = {"notifications", "assertions", "contractFailures"};

bool expects(const Scene& scene, const char* key) {
  return scene.expect && scene.expect->contains(key);
}

// A scene that asks nothing is there for what it says.
bool isWanted(const Scene& scene, const ScreenReading& reading) {
  const bool asksNothing = !scene.expect && scene.steps.empty();
  return expects(scene, reading.key) || (asksNothing && reading.read == spoken);
}

Json formerExpectation(const Scene& scene) {
  return scene.expect ? *scene.expect : Json::object();
}

// What the scene expects of the whole already, and everything else that there was.
Json expectationOf(const Scene& scene, const Outcome& outcome) {
  Json wanted = formerExpectation(scene);
  for (const auto& [key, found] : outcome.whole.items()) {
    if (wanted.contains(key)) {
      wanted[key] = reader::accepted(wanted[key], found);
    } else if (!found.empty()) {
      wanted[key] = found;
    }
  }
  return wanted;
}

std::string shown(const std::optional<Json>& value) {
  return value ? value->dump(-1, ' ', false, Json::error_handler_t::replace) : "nothing";
}

void write(const std::string& file, const std::string& text) {
  std::ofstream out(file, std::ios::binary | std::ios::trunc);
  if (!(out << text).flush()) throw reader::Fault{file, "", "cannot be written", "a file to write to"};
}

}  // namespace

Outcome runScene(ShownScene& shown) {
  const Scene& scene = shown.scene();
  Outcome outcome;
  for (const ScreenReading& reading : screenReadings) {
    if (!isWanted(scene, reading) || !shown.run().screen()) continue;
    outcome.whole[reading.key] = reading.read(shown.snapshot(), shown.run().title());
  }
  outcome.document = shown.run().runSteps();
  outcome.replies = shown.run().replies();
  for (const char* key : reportKeys) outcome.whole[key] = outcome.document[key];
  return outcome;
}

bool holds(const Scene& scene, const Outcome& outcome) {
  std::vector<Difference> all;
  const auto add = [&](std::vector<Difference> more) { all.insert(all.end(), more.begin(), more.end()); };
  for (std::size_t i = 0; i < scene.steps.size(); ++i) {
    const auto& expect = scene.steps[i].expect;
    const Json found = outcome.replies[i].value_or(Json());
    if (expect) add(reader::differences(*expect, found, scene.steps[i].place + "/expect"));
  }
  if (scene.expect) add(reader::differences(*scene.expect, outcome.whole, "/expect"));
  for (const Difference& difference : all) {
    complain(
        reader::Fault{scene.file, difference.place, shown(difference.found), shown(difference.expected)});
  }
  return all.empty();
}

ExitCode accept(const Scene& scene, const Outcome& outcome) {
  if (scene.file == "-") throw reader::Fault{"--accept", "", "standard input", "a file to write to"};
  const std::string before = readInput(scene.file);
  std::string text = before;
  for (std::size_t i = 0; i < scene.steps.size(); ++i) {
    if (!outcome.replies[i]) continue;
    const Json& found = *outcome.replies[i];
    const auto& expect = scene.steps[i].expect;
    if (expect && reader::differences(*expect, found, "").empty()) continue;
    text = reader::withMember(text, scene.steps[i].place, "expect",
                              expect ? reader::accepted(*expect, found) : found, scene.file);
  }
  const Json whole = expectationOf(scene, outcome);
  if (!whole.empty() && whole != formerExpectation(scene)) {
    text = reader::withMember(text, "", "expect", whole, scene.file);
  }
  if (text != before) write(scene.file, text);
  return exitDone;
}

}  // namespace ax::app
