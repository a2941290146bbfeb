#include "host/workouts/WorkoutFigures.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>

#include "host/core/HostStrings.h"
#include "platform/foundation/Environment.h"
#include "platform/foundation/Formatters.h"
#include "platform/toolkit/AccessibilityMessages.h"

namespace ax::host {

namespace {

const Message<Ref<Object>(Ref<Object>, Ref<String>)> attrStringWithValueUnit{"attrStringWithValue:unit:"};

// How a unit is shown: its key in the app's texts, and whether its figures have decimals.
struct ShownUnit {
  std::string_view unitString;
  std::string_view key;
  FloatFormat format;
};

constexpr std::array shownUnits = {
    ShownUnit{"kcal", "unit.kcal", FloatFormat::whole},
    ShownUnit{"kJ", "unit.kj", FloatFormat::whole},
    ShownUnit{"km", "unit.km", FloatFormat::twoDecimals},
    ShownUnit{"mi", "unit.mi", FloatFormat::twoDecimals},
    ShownUnit{"m", "unit.m", FloatFormat::whole},
    ShownUnit{"yd", "unit.yd", FloatFormat::whole},
    ShownUnit{"ft", "unit.ft", FloatFormat::whole},
    ShownUnit{"km/hr", "unit.km.per.hour", FloatFormat::twoDecimals},
    ShownUnit{"mi/hr", "unit.mi.per.hour", FloatFormat::twoDecimals},
    ShownUnit{"count/min", "unit.bpm", FloatFormat::whole},
    ShownUnit{"W", "unit.w", FloatFormat::whole},
    ShownUnit{"rev/min", "unit.rpm", FloatFormat::whole},
    ShownUnit{"step/min", "unit.steps.per.minute", FloatFormat::whole},
    ShownUnit{"stroke/min", "unit.strokes.per.minute", FloatFormat::whole},
};

// Null for none, and for one that the app has no texts for.
const ShownUnit* shownUnit(const Ref<Unit>& unit) {
  if (!unit) return nullptr;
  const auto found = std::ranges::find(shownUnits, std::string_view(unit->text()), &ShownUnit::unitString);
  return found == shownUnits.end() ? nullptr : &*found;
}

double wholeSeconds(double seconds) {
  return std::isfinite(seconds) ? std::clamp(std::round(seconds), 0.0, 1e9) : 0;
}

Ref<AttributedString> withUnit(const Ref<String>& number, std::string_view unitKey,
                               const Ref<String>& spokenUnit) {
  const Ref<String> unit = textWithSpokenForm(hostText(unitKey)->text(), spokenUnit);
  const auto styled = cast<AttributedString>(attrStringWithValueUnit(String::staticClass(), number, unit));
  return styled ? styled : make<AttributedString>(string(number->text() + " " + unit->text()));
}

Ref<Quantity> asShown(const Ref<Quantity>& quantity) {
  const Ref<Unit> preferred = Unit::unitFromString(environment().energyUnit);
  if (!preferred || !quantity->isCompatibleWithUnit(preferred)) return quantity;
  return ax::quantity(quantity->doubleValueForUnit(preferred), preferred);
}

Ref<AttributedString> missingFigure() {
  return make<AttributedString>(string("--"));
}

std::string paceText(double secondsPerUnit) {
  if (!std::isfinite(secondsPerUnit) || secondsPerUnit <= 0) return "--'--\"";
  const auto seconds = static_cast<long>(wholeSeconds(secondsPerUnit));
  char text[32];
  std::snprintf(text, sizeof text, "%ld'%02ld\"", seconds / 60, seconds % 60);
  return text;
}

// The end of the keys of what a pace is told by.
std::string distanceKey(const Unit& unitOfDistance) {
  const std::string& unit = unitOfDistance.text();
  if (unit == "m" || unit == "yd") return "per.100" + unit;
  return unit == "mi" ? "per.mi" : "per.km";
}

}  // namespace

std::string clockText(double seconds) {
  const auto whole = static_cast<long>(wholeSeconds(seconds));
  char text[32];
  if (whole < 3600) {
    std::snprintf(text, sizeof text, "%ld:%02ld", whole / 60, whole % 60);
  } else {
    std::snprintf(text, sizeof text, "%ld:%02ld:%02ld", whole / 3600, whole / 60 % 60, whole % 60);
  }
  return text;
}

Ref<AttributedString> clockFigure(double seconds) {
  auto figure = make<AttributedString>(string(clockText(seconds)));
  messages::setAccessibilityLabel(figure, durationStringForDuration(seconds));
  return figure;
}

Ref<AttributedString> figureOf(const Ref<Quantity>& given) {
  if (!given) return missingFigure();
  const Ref<Quantity> quantity = asShown(given);
  const ShownUnit* unit = shownUnit(quantity->unit());
  if (unit == nullptr) return make<AttributedString>(string(quantity->description()));
  const Ref<String> number = formatFloat(unit->format, static_cast<float>(quantity->value()));
  return withUnit(number, unit->key, quantity->unit()->spokenName());
}

Ref<AttributedString> paceFigure(double secondsPerUnit, const Unit& unitOfDistance) {
  const std::string key = distanceKey(unitOfDistance);
  const Ref<String> spoken =
      make<UnitName>(hostText("unit." + key + ".spoken")->text(), hostText("pace." + key));
  return withUnit(string(paceText(secondsPerUnit)), "unit." + key, spoken);
}

Ref<String> spokenPace(double secondsPerUnit, const Unit& unitOfDistance) {
  return hostText("pace." + distanceKey(unitOfDistance), {durationStringForDuration(secondsPerUnit)});
}

Ref<String> plainText(const Ref<AttributedString>& figure) {
  if (!figure) return nullptr;
  return textWithSpokenForm(figure->description(), messages::accessibilityLabel(figure));
}

Ref<String> textWithSpokenForm(std::string text, const Ref<String>& spoken) {
  Ref<String> result = string(std::move(text));
  if (spoken) messages::setAccessibilityLabel(result, spoken);
  return result;
}

Ref<String> distanceInWords(const Ref<Quantity>& distance) {
  const ShownUnit* unit = distance ? shownUnit(distance->unit()) : nullptr;
  if (unit == nullptr) return nullptr;
  const Ref<String> number = formatFloat(unit->format, static_cast<float>(distance->value()));
  return hostText("value.with.unit", {number, distance->unit()});
}

Ref<String> titleOf(const Workout& workout) {
  return hostText("workout." + std::string(nameOfWorkoutActivityType(workout.workoutActivityType())));
}

}  // namespace ax::host
