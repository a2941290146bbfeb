#include "reader/scene/EnvironmentReader.h"

#include <array>

#include "platform/formatting/IsoTime.h"
#include "platform/formatting/Region.h"
#include "platform/health/Unit.h"

namespace ax::reader {

namespace {

std::string readLocale(const JsonNode& node) {
  if (!formatting::isKnownLocale(node.text())) node.failKind("a locale such as \"en_US\" or \"ar_EG\"");
  return node.text();
}

std::string readTimeZone(const JsonNode& node) {
  if (!formatting::isKnownTimeZone(node.text())) node.failKind("a time zone such as \"Europe/Berlin\"");
  return node.text();
}

std::string readNow(const JsonNode& node) {
  if (!formatting::timeFromIso(node.text())) {
    node.failKind("a date such as \"2026-03-08T09:00:00\", local or with an offset");
  }
  return node.text();
}

std::string readEnergyUnit(const JsonNode& node) {
  const Ref<Unit> unit = Unit::unitFromString(node.text());
  if (!unit || !unit->isCompatibleWithUnit(*Unit::kilocalorieUnit())) {
    node.failKind("a unit of energy: kcal, cal or kJ");
  }
  return node.text();
}

WheelchairUse readWheelchair(const JsonNode& node) {
  static constexpr std::array<std::pair<std::string_view, WheelchairUse>, 4> uses = {
      {{"unknown", WheelchairUse::unknown},
       {"no", WheelchairUse::no},
       {"yes", WheelchairUse::yes},
       {"error", WheelchairUse::error}}};
  const std::string name = node.text();
  for (const auto& [known, use] : uses) {
    if (name == known) return use;
  }
  node.failKind("one of unknown, no, yes, error");
}

bool readBoolean(const JsonNode& node) {
  return node.boolean();
}
std::string readName(const JsonNode& node) {
  return node.text();
}
int readWeekday(const JsonNode& node) {
  return static_cast<int>(node.integer(1, 7));
}

template <class T>
void readInto(std::optional<T>& member, const JsonNode& node, const char* key, T (*read)(const JsonNode&)) {
  if (const auto field = node.optionalField(key)) member = read(*field);
}

}  // namespace

SceneEnvironment readEnvironment(const JsonNode& node) {
  node.expectKeys({"locale", "timeZone", "now", "screenReader", "wheelchair", "firstName", "firstDayOfWeek",
                   "energyUnit", "checks"});
  SceneEnvironment result;
  readInto(result.locale, node, "locale", readLocale);
  readInto(result.timeZone, node, "timeZone", readTimeZone);
  readInto(result.now, node, "now", readNow);
  readInto(result.screenReader, node, "screenReader", readBoolean);
  readInto(result.wheelchair, node, "wheelchair", readWheelchair);
  readInto(result.firstName, node, "firstName", readName);
  readInto(result.firstDayOfWeek, node, "firstDayOfWeek", readWeekday);
  readInto(result.energyUnit, node, "energyUnit", readEnergyUnit);
  readInto(result.checks, node, "checks", readBoolean);
  return result;
}

}  // namespace ax::reader
