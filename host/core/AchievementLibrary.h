#pragma once

#include "platform/foundation/String.h"

// The host's achievements library, as far as titles go.
namespace ax::host {

// Something that the user has earned. A title may hold "{name}" where the user's first name goes.
class ACHAchievement : public Object {
 public:
  static Class& staticClass();

  const Ref<String>& title() const { return title_; }
  const Ref<String>& wheelchairTitle() const { return wheelchairTitle_; }

 private:
  Ref<String> title_;
  Ref<String> wheelchairTitle_;  // for users of a wheelchair, where it differs
};

class ODUIAchievementLocalizationProvider : public Object {
 public:
  static Class& staticClass();

  void setName(Ref<String> name) { name_ = std::move(name); }
  void setWheelchairUser(bool isWheelchairUser) { isWheelchairUser_ = isWheelchairUser; }
  // Nil for what is no achievement, or has no title.
  Ref<String> titleForAchievement(Ref<Object> achievement);

 private:
  Ref<String> name_;
  bool isWheelchairUser_ = false;
};

}  // namespace ax::host
