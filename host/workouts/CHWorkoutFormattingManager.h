#pragma once

#include "platform/foundation/AttributedString.h"
#include "platform/health/Workout.h"

namespace ax::host {

// Through it the app writes the figures of its workouts.
class CHWorkoutFormattingManager : public Object {
 public:
  static Class& staticClass();
  static Ref<CHWorkoutFormattingManager> sharedInstance();

  // "42:10" or "1:05:30"; nil for no workout. The context says where it is shown.
  Ref<AttributedString> formattedDurationForWorkoutContext(Ref<Workout> workout, Ref<Object> context);
};

// The duration as everybody asks for it: by message, so that overrides answer too.
Ref<AttributedString> formattedDuration(const Ref<Workout>& workout, std::string_view context);

}  // namespace ax::host
