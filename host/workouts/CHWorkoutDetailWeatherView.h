#pragma once

#include "platform/health/Quantity.h"
#include "platform/toolkit/Control.h"
#include "platform/toolkit/ImageView.h"
#include "platform/toolkit/Label.h"

namespace ax::host {

// The weather of a workout: "_CHWorkoutDetailWeatherView". A strip with a condition image, temperature,
// humidity, and a button that names where the data come from.
class CHWorkoutDetailWeatherView : public View {
 public:
  static Class& staticClass();

  // Shows the weather. Temperature and humidity are texts, or Numbers: degrees, and a fraction of one. The
  // condition is the legacy code; 0 shows no image.
  void setTemperatureHumidityWeatherConditionFormattingManager(Ref<Object> temperature, Ref<Object> humidity,
                                                               std::int64_t condition,
                                                               Ref<Object> formattingManager);
  void layoutSubviews() override;

  // The same piece by piece; the condition, which comes last, shows all three.
  const Ref<Object>& temperature() const { return temperature_; }
  void setTemperature(Ref<Object> temperature) { temperature_ = std::move(temperature); }
  const Ref<Object>& humidity() const { return humidity_; }
  void setHumidity(Ref<Object> humidity) { humidity_ = std::move(humidity); }
  std::int64_t weatherCondition() const { return weatherCondition_; }
  void setWeatherCondition(std::int64_t condition);

 private:
  Ref<Object> temperature_;
  Ref<Object> humidity_;
  std::int64_t weatherCondition_ = 0;
  Ref<ImageView> weatherConditionImageView_;
  Ref<Label> temperatureLabel_;
  Ref<Label> humidityLabel_;
  Ref<Button> twcButton_;
};

}  // namespace ax::host
