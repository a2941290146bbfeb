#include "bundle/core/Category.h"
#include "platform/foundation/WeatherUtilities.h"
#include "platform/toolkit/AccessibilityElement.h"
#include "platform/toolkit/ImageView.h"

namespace ax {

namespace {

constinit const Message<void(Ref<Object>, Ref<Object>, std::int64_t, Ref<Object>)> setWeather{
    "setTemperature:humidity:weatherCondition:formattingManager:"};

// The weather strip: one summary of all it shows, then the host's attribution button.
class CHWorkoutDetailWeatherViewAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("View");
    contract.instanceVariable("_weatherConditionImageView", "ImageView");
    contract.instanceVariable("_twcButton", "Button");
    contract.instanceMethod("setTemperature:humidity:weatherCondition:formattingManager:",
                            {"v", "@", "@", "q", "@"});
  }

  Ref<Array> accessibilityElements() {
    if (const Ref<Object> cached = self._accessibilityValueForKey(StorageKeyChildren.get()))
      return cast<Array>(cached);
    Ref<Object> button = self.safeValueForKey("_twcButton"_key);
    if (button.get() == &self) button = nullptr;  // the list would keep its keeper
    const Ref<Array> elements = axArrayByIgnoringNilElementsWithCount(2, {summaryWithout(button), button});
    self._accessibilitySetRetainedValueForKey(elements, StorageKeyChildren.get());
    return elements;
  }

  void setTemperatureHumidityWeatherConditionFormattingManager(Ref<Object> temperature, Ref<Object> humidity,
                                                               std::int64_t weatherCondition,
                                                               Ref<Object> formattingManager) {
    super(setWeather, temperature, humidity, weatherCondition, formattingManager);
    const Ref<ImageView> imageView =
        castAsClass<ImageView>(self.safeValueForKey("_weatherConditionImageView"_key));
    if (!messages::image(imageView)) return;
    const std::int64_t code = conditionCodeFromLegacyWeatherConditionCode(weatherCondition);
    messages::setAccessibilityLabel(
        imageView, WeatherUtilities::sharedInstance()->descriptionForWeatherWXQConditionCode(code));
    messages::setIsAccessibilityElement(imageView, true);
  }

 private:
  Ref<AccessibilityElement> summaryWithout(const Ref<Object>& button) {
    Array::Items shown;
    Rect frame;
    if (const Ref<Array> subviews = messages::subviews(castAsClass<View>(self))) {
      for (const Ref<Object>& subview : *subviews) {
        if (subview == button) continue;
        shown.push_back(subview);
        frame = frame.unionWith(messages::frame(subview));
      }
    }
    const Ref<AccessibilityElement> summary = AccessibilityElement::initWithAccessibilityContainer(self);
    messages::setAccessibilityFrameInContainerSpace(summary, frame);
    messages::setAccessibilityLabel(summary, labelForElements(array(std::move(shown))));
    return summary;
  }
};

}  // namespace

AX_CATEGORY(CHWorkoutDetailWeatherViewAccessibility, "_CHWorkoutDetailWeatherView",
            overrides<&C::setTemperatureHumidityWeatherConditionFormattingManager>(setWeather))

}  // namespace ax
