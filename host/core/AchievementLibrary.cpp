#include "host/core/AchievementLibrary.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& ACHAchievement::staticClass() {
  static Class& result = ClassBuilder<ACHAchievement>("ACHAchievement", Object::staticClass())
                             .instanceVariable<&ACHAchievement::title_>("title")
                             .instanceVariable<&ACHAchievement::wheelchairTitle_>("wheelchairTitle")
                             .build();
  return result;
}

Class& ODUIAchievementLocalizationProvider::staticClass() {
  using T = ODUIAchievementLocalizationProvider;
  static Class& result = ClassBuilder<T>("ODUIAchievementLocalizationProvider", Object::staticClass())
                             .method<&T::setName>("setName:")
                             .method<&T::setWheelchairUser>("setWheelchairUser:")
                             .method<&T::titleForAchievement>("titleForAchievement:")
                             .build();
  return result;
}

Ref<String> ODUIAchievementLocalizationProvider::titleForAchievement(Ref<Object> achievement) {
  const ACHAchievement* known = cast<ACHAchievement>(achievement.get());
  if (known == nullptr) return nullptr;
  const Ref<String>& title =
      isWheelchairUser_ && known->wheelchairTitle() ? known->wheelchairTitle() : known->title();
  constexpr std::string_view namePlace = "{name}";
  if (!title || !title->contains(namePlace)) return title;
  std::string text = title->text();
  text.replace(text.find(namePlace), namePlace.size(), name_ ? name_->text() : "");
  return string(std::move(text));
}

static const RegisteredClass<ACHAchievement> registered;
static const RegisteredClass<ODUIAchievementLocalizationProvider> registeredProvider;

}  // namespace ax::host
