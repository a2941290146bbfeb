#include "bundle/shared/LocalizedString.h"

#include "bundle/shared/WheelchairUse.h"
#include "platform/base/NeverDestroyed.h"
#include "platform/foundation/AddressBook.h"
#include "platform/foundation/Bundle.h"
#include "platform/runtime/SafeMessage.h"

namespace ax {

namespace {

constinit const SafeMessage<void(Ref<String>)> setName{"setName:"};
constinit const SafeMessage<void(bool)> setWheelchairUser{"setWheelchairUser:"};
constinit const SafeMessage<Ref<String>(Ref<Object>)> titleForAchievement{"titleForAchievement:"};

Ref<Object> makeAchievementLocalizationProvider() {
  const Class* providerClass = safeClassFromString("ODUIAchievementLocalizationProvider"_key);
  if (providerClass == nullptr) return nullptr;
  Ref<Object> provider = providerClass->instantiate();
  setName(provider, copyUserFirstNameFromAddressBook());
  setWheelchairUser(provider, _userIsWheelchairUserWithParloOn());
  return provider;
}

// The host library's provider, made once with the settings of that moment.
const Ref<Object>& achievementLocalizationProvider() {
  static NeverDestroyed<Ref<Object>> provider(makeAchievementLocalizationProvider());
  return *provider;
}

}  // namespace

Ref<String> accessibilityLocalizedString(std::string_view key) {
  const Ref<Bundle> bundle = Bundle::bundleForClass(safeClassFromString("AXVeltoGlue"_key));
  return bundle ? bundle->localizedStringForKey(key, emptyString(), "Accessibility") : nullptr;
}

}  // namespace ax

using namespace ax;

Ref<String> accessibilityLocalizedString(const Ref<String>& key) {
  return ax::accessibilityLocalizedString(key ? std::string_view(key->text()) : std::string_view());
}

Ref<String> accessibilityLocalizedStringForAchievement(const Ref<Object>& achievement) {
  const Ref<Object>& provider = achievementLocalizationProvider();
  if (!achievement || !achievement->isKindOf(safeClassFromString("ACHAchievement"_key))) return nullptr;
  return titleForAchievement(provider, achievement);
}
