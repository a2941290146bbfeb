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

  // Shows the weather. Temperature and humidity are Strings or Numbers; the condition is the legacy code, and
  // 0 shows no image.
  void setTemperatureHumidityWeatherConditionFormattingManager(Ref<Object> temperature, Ref<Object> humidity,
                                                               std::int64_t condition,
                                                               Ref<Object> formattingManager);
  void layoutSubviews() override;

 private:
  Ref<ImageView> weatherConditionImageView_;
  Ref<Label> temperatureLabel_;
  Ref<Label> humidityLabel_;
  Ref<Button> twcButton_;
};

}  // namespace ax::host
