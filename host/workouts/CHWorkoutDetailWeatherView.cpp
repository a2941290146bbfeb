#include "host/workouts/CHWorkoutDetailWeatherView.h"

#include "host/core/Layout.h"
#include "host/workouts/CHWorkoutFormattingManager.h"
#include "host/workouts/WorkoutFigures.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const Message<void(Ref<Object>, Ref<Object>, std::int64_t, Ref<Object>)> setWeather{
    "setTemperature:humidity:weatherCondition:formattingManager:"};

Ref<String> temperatureText(const Ref<Object>& temperature) {
  const Ref<Number> degrees = cast<Number>(temperature);
  return degrees ? hostText("weather.temperature", {formatFloat(FloatFormat::whole, degrees->floatValue())})
                 : cast<String>(temperature);
}

Ref<String> humidityText(const Ref<Object>& humidity) {
  const Ref<Number> fraction = cast<Number>(humidity);
  return fraction ? hostText("weather.humidity", {formatFloatWithPercentage(fraction->floatValue())})
                  : cast<String>(humidity);
}

}  // namespace

Class& CHWorkoutDetailWeatherView::staticClass() {
  using T = CHWorkoutDetailWeatherView;
  static Class& result = ClassBuilder<T>("_CHWorkoutDetailWeatherView", View::staticClass())
                             .instanceVariable<&T::weatherConditionImageView_>("_weatherConditionImageView")
                             .instanceVariable<&T::temperatureLabel_>("_temperatureLabel")
                             .instanceVariable<&T::humidityLabel_>("_humidityLabel")
                             .instanceVariable<&T::twcButton_>("_twcButton")
                             .property<&T::temperature, &T::setTemperature>("temperature")
                             .property<&T::humidity, &T::setHumidity>("humidity")
                             .property<&T::weatherCondition, &T::setWeatherCondition>("weatherCondition")
                             .method<&T::setTemperatureHumidityWeatherConditionFormattingManager>(
                                 "setTemperature:humidity:weatherCondition:formattingManager:")
                             .build();
  return result;
}

void CHWorkoutDetailWeatherView::setTemperatureHumidityWeatherConditionFormattingManager(
    Ref<Object> temperature, Ref<Object> humidity, std::int64_t condition, Ref<Object>) {
  ensure(temperatureLabel_).setText(temperatureText(temperature));
  ensure(humidityLabel_).setText(humidityText(humidity));
  ensure(weatherConditionImageView_).setImage(condition == 0 ? nullptr : make<Image>());
  layoutSubviews();
}

void CHWorkoutDetailWeatherView::setWeatherCondition(std::int64_t condition) {
  weatherCondition_ = condition;
  setWeather(*this, temperature_, humidity_, condition, CHWorkoutFormattingManager::sharedInstance());
}

void CHWorkoutDetailWeatherView::layoutSubviews() {
  const double height = frame().height;
  showIn(*this, weatherConditionImageView_, {0, 0, height, height});
  showIn(*this, temperatureLabel_, {height, 0, 60, height});
  showIn(*this, humidityLabel_, {height + 60, 0, 100, height});
  showIn(*this, twcButton_, {frame().width - 80, 0, 80, height});
}

static const RegisteredClass<CHWorkoutDetailWeatherView> registered;

}  // namespace ax::host
