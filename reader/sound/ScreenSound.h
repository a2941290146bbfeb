#pragma once

#include <cstddef>
#include <functional>
#include <string>

#include "reader/snapshot/Snapshot.h"
#include "reader/sound/Sound.h"

namespace ax::reader {

// Takes one piece of a screen, with how many came before it and how many there are.
using ScreenSoundPiece = std::function<void(const Sound& sound, std::size_t before, std::size_t all)>;

// Speaks the transcript of a screen in the language of the environment, line by line with a breath after
// each, and plays each chart where it stands. Without a voice for the language the charts' tones alone are
// left. It is handed over in pieces, since all of a long screen takes much memory. Main thread only.
void soundScreen(const Snapshot& snapshot, const std::string& title, const ScreenSoundPiece& take);

}  // namespace ax::reader
