#pragma once

#include <optional>
#include <string>

#include "reader/sound/Sound.h"

// Lines spoken by the speech library, offline. It remembers a little of what it said before: the same lines
// in the same order since the process began sound the same. Main thread only.
namespace ax::reader {

// Whether a voice reads the language of a locale such as "de_DE". None does when the library's voices are not
// installed.
bool hasVoice(const std::string& locale);

// The line at a normal rate, in the middle. Nothing without a voice.
std::optional<Sound> spokenSound(const std::string& line, const std::string& locale);

// How many seconds that takes; below 0 without a voice.
double speakingTime(const std::string& line, const std::string& locale);

}  // namespace ax::reader
