#pragma once

#include <cstdint>
#include <span>

// One function for each kind of input that comes from strangers. Any bytes will do; a fault shows as a
// signal, a sanitizer's report or an exception that leaves the function.
namespace ax::fuzz {

using Bytes = std::span<const std::uint8_t>;

void fuzzDates(Bytes bytes);
void fuzzMessages(Bytes bytes);
void fuzzPace(Bytes bytes);
void fuzzScenes(Bytes bytes);
void fuzzTimes(Bytes bytes);
void fuzzWorkouts(Bytes bytes);

}  // namespace ax::fuzz
