#pragma once

#include <map>

#include "platform/foundation/UnitName.h"

namespace ax {

enum class MetricPrefix { none, milli, kilo };

// A unit of measurement: a product of powers of base units, with a factor to the base. Its description is
// its spoken name in the reader's language where there is one, else its unit string; a plain count has none.
class Unit final : public Object {
 public:
  static Class& staticClass();
  // What the unit measures: the power of each base quantity.
  using Dimension = std::map<char, int>;

  Unit(std::string unitString, double factor, Dimension dimension)
      : text_(&sharedText(std::move(unitString))), factor_(factor), dimension_(std::move(dimension)) {}

  // Nil for a text that names no unit: "kcal", "min", "km", "ml/kg/min", "count/min" are some that do.
  static Ref<Unit> unitFromString(std::string_view text);

  static Ref<Unit> kilocalorieUnit() { return unitFromString("kcal"); }
  static Ref<Unit> minuteUnit() { return unitFromString("min"); }
  static Ref<Unit> hourUnit() { return unitFromString("hr"); }
  static Ref<Unit> countUnit() { return unitFromString("count"); }
  static Ref<Unit> meterUnit() { return unitFromString("m"); }
  // Nil for a prefix and unit that unitFromString does not know together.
  static Ref<Unit> literUnitWithMetricPrefix(MetricPrefix prefix);
  static Ref<Unit> gramUnitWithMetricPrefix(MetricPrefix prefix);
  static Ref<Unit> meterUnitWithMetricPrefix(MetricPrefix prefix);
  Ref<Unit> unitDividedByUnit(const Unit& divisor) const;

  const std::string& text() const { return *text_; }
  Ref<String> unitString() const { return string(*text_); }
  double factor() const { return factor_; }
  bool hasTextOf(const Unit& other) const { return text_ == other.text_; }
  bool isCompatibleWithUnit(const Unit& other) const { return dimension_ == other.dimension_; }

  // How it is spoken, beside a number or alone.
  Ref<UnitName> spokenName() const;
  // Of its spoken name; nil where it has none.
  Ref<String> countedPattern() const;

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 private:
  // One text for all units that have it; it lives as long as the process. Any thread.
  static const std::string& sharedText(std::string text);

  const std::string* text_;
  double factor_;
  Dimension dimension_;
};

}  // namespace ax
