#pragma once

#include "reader/sound/Sound.h"

// How a value sounds. Nothing here fails; any thread.
namespace ax::reader {

inline constexpr double lowestPitch = 200;  // hertz, of an axis' minimum
inline constexpr double highestPitch = 1400;
inline constexpr double noteSeconds = 0.2;

// The pitch of a height from 0 at an axis' minimum to 1 at its maximum, in hertz. Equal steps of height are
// equal musical intervals; beyond the axis it is that of its end.
double pitchOf(double height);

// One note: a sine that begins and ends softly and is as loud as one of any other pitch. The pan runs from 0
// on the left to 1 on the right.
Sound note(double pitch, double pan, double seconds = noteSeconds);

}  // namespace ax::reader
