#include "reader/scene/ValueReader.h"

#include <array>
#include <cmath>
#include <limits>

#include "platform/formatting/IsoTime.h"
#include "platform/health/Unit.h"
#include "reader/scene/ObjectReader.h"

namespace ax::reader {

namespace {

SceneText readText(const JsonNode& node, SceneIds& ids) {
  if (!node.isObject()) return SceneText(node.text());
  node.expectKeys({"localized", "with"});
  const auto with = node.optionalField("with");
  return {node.field("localized").text(), with ? readValues(*with, ids) : std::vector<SceneValue>()};
}

SceneDate readDate(const JsonNode& node) {
  const std::string iso = node.text();
  if (!formatting::timeFromIso(iso)) {
    node.failKind("a date such as \"2026-03-08T14:30:00\", local or with an offset");
  }
  return {iso};
}

std::string readUnit(const JsonNode& node) {
  if (!Unit::unitFromString(node.text())) node.failKind("a unit such as \"kcal\", \"km\" or \"count/min\"");
  return node.text();
}

template <std::size_t N>
std::array<double, N> readReals(const JsonNode& node, const std::string& expected) {
  node.expectCount(N, expected);
  std::array<double, N> reals;
  for (std::size_t i = 0; i < N; ++i) reals[i] = node.item(i).real();
  return reals;
}

// Readers of the kinds that are written as an object; each gets the whole of it.
SceneContent string(const JsonNode& node, SceneIds& ids) {
  SceneString result{readText(node.field("string"), ids)};
  if (const auto label = node.optionalField("label")) result.label = readText(*label, ids);
  return result;
}

SceneContent attributed(const JsonNode& node, SceneIds& ids) {
  SceneString result{readText(node.field("attributed"), ids)};
  if (const auto label = node.optionalField("label")) result.label = readText(*label, ids);
  result.isAttributed = true;
  return result;
}

SceneContent localized(const JsonNode& node, SceneIds& ids) {
  return SceneString{readText(node, ids)};
}

SceneContent reference(const JsonNode& node, SceneIds& ids) {
  ids.refer(node.field("ref"));
  return SceneReference{node.field("ref").text()};
}

SceneContent date(const JsonNode& node, SceneIds&) {
  return readDate(node.field("date"));
}

SceneContent interval(const JsonNode& node, SceneIds&) {
  const JsonNode ends = node.field("interval");
  ends.expectCount(2, "two dates, the start and the end");
  return SceneInterval{readDate(ends.item(0)), readDate(ends.item(1))};
}

SceneContent point(const JsonNode& node, SceneIds&) {
  const auto [x, y] = readReals<2>(node.field("point"), "two numbers, x and y");
  return Point{x, y};
}

SceneContent size(const JsonNode& node, SceneIds&) {
  const auto [width, height] = readReals<2>(node.field("size"), "two numbers, width and height");
  return Size{width, height};
}

SceneContent rect(const JsonNode& node, SceneIds&) {
  const auto [x, y, width, height] = readReals<4>(node.field("rect"), "four numbers: x, y, width and height");
  return Rect{x, y, width, height};
}

SceneContent insets(const JsonNode& node, SceneIds&) {
  const auto [top, left, bottom, right] =
      readReals<4>(node.field("insets"), "four numbers: top, left, bottom and right");
  return Insets{top, left, bottom, right};
}

SceneContent quantity(const JsonNode& node, SceneIds&) {
  const JsonNode parts = node.field("quantity");
  parts.expectCount(2, "a number and a unit");
  return SceneQuantity{parts.item(0).real(), readUnit(parts.item(1))};
}

SceneContent unit(const JsonNode& node, SceneIds&) {
  return SceneUnit{readUnit(node.field("unit"))};
}

SceneContent selector(const JsonNode& node, SceneIds&) {
  const std::string name = node.field("selector").text();
  if (name.empty()) node.field("selector").failKind("the name of a method");
  return Selector::intern(name);
}

Number::Content unsignedNumber(const JsonNode& node) {
  if (!node.json().is_number_unsigned()) node.failKind("a whole number that is not negative");
  return node.json().get<std::uint64_t>();
}

Number::Content singleNumber(const JsonNode& node) {
  const double value = node.real();
  if (std::isfinite(value) && std::abs(value) > std::numeric_limits<float>::max()) {
    node.failKind("a number that a float holds");
  }
  return static_cast<float>(value);
}

SceneContent number(const JsonNode& node, SceneIds&) {
  const JsonNode given = node.field("number");
  const JsonNode as = node.field("as");
  const std::string type = as.text();
  using Limits = std::numeric_limits<std::int64_t>;
  if (type == "bool") return Number::Content(given.boolean());
  if (type == "int") return Number::Content(given.integer(Limits::min(), Limits::max()));
  if (type == "uint") return unsignedNumber(given);
  if (type == "float") return singleNumber(given);
  if (type == "double") return Number::Content(given.real());
  as.failKind("one of bool, int, uint, float, double");
}

struct Kind {
  const char* key;    // names the kind
  const char* other;  // the key that may stand beside it
  SceneContent (*read)(const JsonNode&, SceneIds&);
};
constexpr std::array kinds = {
    Kind{"ref", "", reference},
    Kind{"string", "label", string},
    Kind{"localized", "with", localized},
    Kind{"number", "as", number},
    Kind{"quantity", "", quantity},
    Kind{"unit", "", unit},
    Kind{"date", "", date},
    Kind{"interval", "", interval},
    Kind{"point", "", point},
    Kind{"size", "", size},
    Kind{"rect", "", rect},
    Kind{"insets", "", insets},
    Kind{"selector", "", selector},
    Kind{"attributed", "label", attributed},
};

SceneContent readKind(const JsonNode& node, SceneIds& ids) {
  if (node.has("class")) return std::make_unique<SceneObject>(readObject(node, ids));
  std::string known = "class";
  for (const Kind& kind : kinds) {
    known.append(", ").append(kind.key);
    if (!node.has(kind.key)) continue;
    if (*kind.other == '\0') {
      node.expectKeys({kind.key});
    } else {
      node.expectKeys({kind.key, kind.other});
    }
    return kind.read(node, ids);
  }
  node.fail("an object of no known kind", "one with the key " + known);
}

SceneContent readPlainNumber(const JsonNode& node) {
  if (node.json().is_number_float()) return Number::Content(node.json().get<double>());
  using Limits = std::numeric_limits<std::int64_t>;
  return Number::Content(node.integer(Limits::min(), Limits::max()));
}

}  // namespace

SceneValue readValue(const JsonNode& node, SceneIds& ids) {
  const Json& json = node.json();
  if (json.is_null()) return {node.place()};
  if (json.is_boolean()) return {node.place(), Number::Content(json.get<bool>())};
  if (json.is_number()) return {node.place(), readPlainNumber(node)};
  if (json.is_string()) return {node.place(), SceneString{SceneText(node.text())}};
  if (json.is_array()) return {node.place(), readValues(node, ids)};
  return {node.place(), readKind(node, ids)};
}

std::vector<SceneValue> readValues(const JsonNode& array, SceneIds& ids) {
  array.expectArray("a list of values");
  std::vector<SceneValue> values;
  array.forEachItem([&](const JsonNode& item) { values.push_back(readValue(item, ids)); });
  return values;
}

}  // namespace ax::reader
