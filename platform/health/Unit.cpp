#include "platform/health/Unit.h"

#include <array>
#include <mutex>
#include <set>

#include "platform/base/NeverDestroyed.h"
#include "platform/foundation/Bundle.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

struct SimpleUnit {
  std::string_view text;
  double factor;
  char dimension;  // energy, time, length, mass, volume, power; a blank for a plain number
};

constexpr std::array simpleUnits = {
    SimpleUnit{"kcal", 4184, 'E'}, SimpleUnit{"cal", 4.184, 'E'},     SimpleUnit{"kJ", 1000, 'E'},
    SimpleUnit{"s", 1, 'T'},       SimpleUnit{"min", 60, 'T'},        SimpleUnit{"hr", 3600, 'T'},
    SimpleUnit{"m", 1, 'L'},       SimpleUnit{"km", 1000, 'L'},       SimpleUnit{"mi", 1609.344, 'L'},
    SimpleUnit{"ft", 0.3048, 'L'}, SimpleUnit{"yd", 0.9144, 'L'},     SimpleUnit{"g", 0.001, 'M'},
    SimpleUnit{"kg", 1, 'M'},      SimpleUnit{"lb", 0.45359237, 'M'}, SimpleUnit{"ml", 0.001, 'V'},
    SimpleUnit{"L", 1, 'V'},       SimpleUnit{"count", 1, ' '},       SimpleUnit{"%", 0.01, ' '},
    SimpleUnit{"W", 1, 'P'},       SimpleUnit{"rev", 1, ' '},         SimpleUnit{"step", 1, ' '},
    SimpleUnit{"stroke", 1, ' '},
};

std::string_view prefixText(MetricPrefix prefix) {
  switch (prefix) {
    case MetricPrefix::milli:
      return "m";
    case MetricPrefix::kilo:
      return "k";
    case MetricPrefix::none:
      break;
  }
  return "";
}

Ref<Unit> simpleUnit(std::string_view text) {
  for (const SimpleUnit& unit : simpleUnits) {
    if (unit.text != text) continue;
    Unit::Dimension dimension;
    if (unit.dimension != ' ') dimension[unit.dimension] = 1;
    return make<Unit>(std::string(text), unit.factor, dimension);
  }
  return nullptr;
}

}  // namespace

Class& Unit::staticClass() {
  static Class& result = ClassBuilder<Unit>("Unit", Object::staticClass())
                             .method<&Unit::unitString>("unitString")
                             .method<&Unit::countedPattern>("countedPattern")
                             .classMethod<&Unit::minuteUnit>("minuteUnit")
                             .build();
  return result;
}

Ref<Unit> Unit::unitFromString(std::string_view text) {
  const std::size_t slash = text.find('/');
  Ref<Unit> unit = simpleUnit(text.substr(0, slash));
  while (unit && text.find('/') != std::string_view::npos) {
    text.remove_prefix(text.find('/') + 1);
    const Ref<Unit> divisor = simpleUnit(text.substr(0, text.find('/')));
    unit = divisor ? unit->unitDividedByUnit(*divisor) : nullptr;
  }
  return unit;
}

const std::string& Unit::sharedText(std::string text) {
  static NeverDestroyed<std::mutex> mutex;
  static NeverDestroyed<std::set<std::string>> texts;
  const std::lock_guard lock(*mutex);
  return *texts->insert(std::move(text)).first;
}

Ref<Unit> Unit::literUnitWithMetricPrefix(MetricPrefix prefix) {
  return unitFromString(prefix == MetricPrefix::none ? "L" : std::string(prefixText(prefix)) + "l");
}
Ref<Unit> Unit::gramUnitWithMetricPrefix(MetricPrefix prefix) {
  return unitFromString(std::string(prefixText(prefix)) + "g");
}
Ref<Unit> Unit::meterUnitWithMetricPrefix(MetricPrefix prefix) {
  return unitFromString(std::string(prefixText(prefix)) + "m");
}

Ref<Unit> Unit::unitDividedByUnit(const Unit& divisor) const {
  Dimension dimension = dimension_;
  for (const auto& [quantity, power] : divisor.dimension_) {
    if ((dimension[quantity] -= power) == 0) dimension.erase(quantity);
  }
  return make<Unit>(text() + "/" + divisor.text(), factor_ / divisor.factor_, std::move(dimension));
}

bool Unit::isEqual(const Object& other) const {
  const Unit* unit = cast<Unit>(&other);
  return unit != nullptr && unit->hasTextOf(*this);
}

Ref<UnitName> Unit::spokenName() const {
  return make<UnitName>(description(), countedPattern());
}

Ref<String> Unit::countedPattern() const {
  return platformString("quantity." + text());
}

std::string Unit::description() const {
  if (text() == "count") return "";
  const Ref<String> spoken = platformString("unit." + text());
  return spoken ? spoken->text() : text();
}

static const RegisteredClass<Unit> registered;

}  // namespace ax
