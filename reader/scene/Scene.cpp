#include "reader/scene/Scene.h"

#include <algorithm>
#include <array>

#include "platform/formatting/IsoTime.h"
#include "platform/health/ActivitySummary.h"
#include "platform/toolkit/ViewController.h"
#include "reader/scene/EnvironmentReader.h"
#include "reader/scene/HostNames.h"
#include "reader/scene/ObjectReader.h"
#include "reader/scene/StepReader.h"
#include "reader/scene/ValueReader.h"

namespace ax::reader {

namespace {

constexpr const char* format = "axvelto-scene/1";

void readOmissions(const JsonNode& host, Scene& scene) {
  host.expectKeys({"without"});
  const auto without = host.optionalField("without");
  if (!without) return;
  without->expectArray("a list of names");
  without->forEachItem([&](const JsonNode& name) {
    scene.without.push_back({name.place(), name.text()});
    checkOmission(scene.without.back(), scene.file);
  });
}

std::int64_t dayIndex(const std::string& day) {
  const Ref<DateComponents> components = make<DateComponents>();
  components->year = std::stoi(day.substr(0, 4));
  components->month = std::stoi(day.substr(5, 2));
  components->day = std::stoi(day.substr(8, 2));
  return cacheIndexFromDateComponents(components);
}

SceneDay readDay(const std::string& day, const JsonNode& node) {
  constexpr std::size_t dateLength = 10;
  if (day.size() != dateLength || !formatting::timeFromIso(day)) {
    node.fail("\"" + day + "\"", "a day such as 2026-03-07");
  }
  node.expectKeys({"move", "exercise", "stand"});
  SceneDay result{dayIndex(day)};
  for (const auto& [key, fraction] :
       std::array{std::pair("move", &result.move), std::pair("exercise", &result.exercise),
                  std::pair("stand", &result.stand)}) {
    if (const auto field = node.optionalField(key)) *fraction = field->real();
  }
  return result;
}

void readDays(const JsonNode& node, Scene& scene) {
  if (!node.isObject()) node.failKind("an object: rings by day");
  if (Class::namedEvenIfHidden("ActivitySummaryCache") == nullptr) {
    node.fail("the host keeps no days", "a host with the class ActivitySummaryCache");
  }
  node.forEachField(
      [&](const std::string& day, const JsonNode& rings) { scene.days.push_back(readDay(day, rings)); });
}

void readScreen(const JsonNode& node, Scene& scene, SceneIds& ids) {
  scene.screen = readObject(node, ids);
  const Class& shown = *Class::namedEvenIfHidden(scene.screen->className);
  if (!shown.isSubclassOf(View::staticClass()) && !shown.isSubclassOf(ViewController::staticClass())) {
    node.field("class").failKind("a view or a view controller");
  }
}

// Titles stay in front of what is shown, so they are texts without references to it.
SceneValue readTitle(const JsonNode& node) {
  if (node.isObject()) {
    node.field("localized").text();
  } else {
    node.text();
  }
  SceneIds none;
  SceneValue title = readValue(node, none);
  none.settleObjects();
  if (!none.unknown().empty()) throw unknownTarget(none.unknown().front(), node.file());
  return title;
}

void readContent(const JsonNode& root, Scene& scene) {
  SceneIds ids;
  if (const auto objects = root.optionalField("objects")) {
    objects->expectArray("a list of objects");
    objects->forEachItem([&](const JsonNode& item) { scene.objects.push_back(readObject(item, ids)); });
  }
  if (const auto screen = root.optionalField("screen")) readScreen(*screen, scene, ids);
  ids.settleObjects();
  if (const auto steps = root.optionalField("steps")) {
    steps->expectArray("a list of steps");
    steps->forEachItem([&](const JsonNode& item) { scene.steps.push_back(readStep(item, ids)); });
  }
  scene.moduleNames = ids.unknown();
}

}  // namespace

Scene readScene(std::string_view text, const std::string& file) {
  return readSceneDocument(readJson(text, file), file);
}

Scene readSceneDocument(const Json& document, const std::string& file) {
  const JsonNode root(document, "", file);
  root.expectKeys(
      {"format", "title", "names", "environment", "host", "days", "screen", "objects", "steps", "expect"});
  if (root.field("format").text() != format) {
    root.field("format").failKind("\"" + std::string(format) + "\"");
  }
  Scene scene{file};
  if (const auto title = root.optionalField("title")) scene.title = readTitle(*title);
  if (const auto names = root.optionalField("names")) {
    names->expectArray("a list of texts");
    names->forEachItem([&](const JsonNode& name) { scene.names.push_back(name.text()); });
  }
  if (const auto environment = root.optionalField("environment")) {
    scene.environment = readEnvironment(*environment);
  }
  if (const auto host = root.optionalField("host")) readOmissions(*host, scene);
  if (const auto days = root.optionalField("days")) readDays(*days, scene);
  readContent(root, scene);
  if (const auto expect = root.optionalField("expect")) {
    expect->expectKeys({"speak", "tree", "graph", "notifications", "assertions", "contractFailures"});
    scene.expect = expect->json();
  }
  return scene;
}

}  // namespace ax::reader
