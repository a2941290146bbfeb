#include "host/workouts/CHWorkoutFormattingManager.h"

#include "host/workouts/WorkoutFigures.h"
#include "platform/base/NeverDestroyed.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Message.h"

namespace ax::host {

namespace {

const Message<Ref<Object>(Ref<Object>, Ref<Object>)> formattedDurationForWorkoutContext{
    "formattedDurationForWorkout:context:"};

}  // namespace

Class& CHWorkoutFormattingManager::staticClass() {
  using T = CHWorkoutFormattingManager;
  static Class& result =
      ClassBuilder<T>("CHWorkoutFormattingManager", Object::staticClass())
          .classMethod<&T::sharedInstance>("sharedInstance")
          .method<&T::formattedDurationForWorkoutContext>("formattedDurationForWorkout:context:")
          .build();
  return result;
}

Ref<CHWorkoutFormattingManager> CHWorkoutFormattingManager::sharedInstance() {
  static NeverDestroyed<Ref<CHWorkoutFormattingManager>> shared(make<CHWorkoutFormattingManager>());
  return *shared;
}

Ref<AttributedString> CHWorkoutFormattingManager::formattedDurationForWorkoutContext(Ref<Workout> workout,
                                                                                     Ref<Object>) {
  return workout ? make<AttributedString>(string(clockText(workout->duration()))) : nullptr;
}

Ref<AttributedString> formattedDuration(const Ref<Workout>& workout, std::string_view context) {
  return cast<AttributedString>(formattedDurationForWorkoutContext(
      CHWorkoutFormattingManager::sharedInstance(), workout, string(std::string(context))));
}

static const RegisteredClass<CHWorkoutFormattingManager> registered;

}  // namespace ax::host
