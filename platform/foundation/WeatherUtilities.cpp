#include "platform/foundation/WeatherUtilities.h"

#include "platform/base/NeverDestroyed.h"
#include "platform/foundation/Bundle.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

Class& WeatherUtilities::staticClass() {
  using T = WeatherUtilities;
  static Class& result =
      ClassBuilder<T>("WeatherUtilities", Object::staticClass())
          .classMethod<&T::sharedInstance>("sharedInstance")
          .method<&T::descriptionForWeatherWXQConditionCode>("descriptionForWeatherWXQConditionCode:")
          .build();
  return result;
}

Ref<WeatherUtilities> WeatherUtilities::sharedInstance() {
  static NeverDestroyed<Ref<WeatherUtilities>> shared(make<WeatherUtilities>());
  return *shared;
}

Ref<String> WeatherUtilities::descriptionForWeatherWXQConditionCode(std::int64_t code) const {
  const Ref<String> known = platformString("weather." + std::to_string(code));
  return known ? known : platformString("weather.unknown");
}

static const RegisteredClass<WeatherUtilities> registered;

}  // namespace ax
