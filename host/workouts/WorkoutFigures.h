#pragma once

#include <span>

#include "host/core/HostStrings.h"
#include "platform/foundation/AttributedString.h"
#include "platform/health/Workout.h"

// Figures of workouts as the app shows them: short, with the spoken form attached where the unit is an
// abbreviation. Main thread only.
namespace ax::host {

// "42:10", or "1:05:30" from an hour on; in whole seconds.
std::string clockText(double seconds);

// The same with its words.
Ref<AttributedString> clockFigure(double seconds);

// "5.01 km", in the quantity's own unit, energies in the user's; "--" for nil.
Ref<AttributedString> figureOf(const Ref<Quantity>& quantity);

// A pace such as 5'30" /km; with two dashes in it when there is none.
Ref<AttributedString> paceFigure(double secondsPerUnit, const Unit& unitOfDistance);
// How a pace is said in words.
Ref<String> spokenPace(double secondsPerUnit, const Unit& unitOfDistance);

// A plain text with the spoken form of a styled one; nil for nil.
Ref<String> plainText(const Ref<AttributedString>& figure);
Ref<String> textWithSpokenForm(std::string text, const Ref<String>& spoken);

// A distance in full words: "1.61 kilometers".
Ref<String> distanceInWords(const Ref<Quantity>& distance);

// "Running".
Ref<String> titleOf(const Workout& workout);

}  // namespace ax::host
