#include "host/workouts/CHWorkoutDetailWeatherView.h"

#include "host/workouts/Placement.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

void show(Ref<Label>& label, const Ref<Object>& content) {
  if (!label) label = make<Label>();
  const Ref<String> text = cast<String>(content);
  label->setText(text || !content ? text : string(content->description()));
}

}  // namespace

Class& CHWorkoutDetailWeatherView::staticClass() {
  using T = CHWorkoutDetailWeatherView;
  static Class& result = ClassBuilder<T>("_CHWorkoutDetailWeatherView", View::staticClass())
                             .instanceVariable<&T::weatherConditionImageView_>("_weatherConditionImageView")
                             .instanceVariable<&T::temperatureLabel_>("_temperatureLabel")
                             .instanceVariable<&T::humidityLabel_>("_humidityLabel")
                             .instanceVariable<&T::twcButton_>("_twcButton")
                             .method<&T::setTemperatureHumidityWeatherConditionFormattingManager>(
                                 "setTemperature:humidity:weatherCondition:formattingManager:")
                             .build();
  return result;
}

void CHWorkoutDetailWeatherView::setTemperatureHumidityWeatherConditionFormattingManager(
    Ref<Object> temperature, Ref<Object> humidity, std::int64_t condition, Ref<Object>) {
  show(temperatureLabel_, temperature);
  show(humidityLabel_, humidity);
  if (!weatherConditionImageView_) weatherConditionImageView_ = make<ImageView>();
  weatherConditionImageView_->setImage(condition == 0 ? nullptr : make<Image>());
  layoutSubviews();
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
