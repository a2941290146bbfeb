#pragma once

#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"
#include "reader/sound/Sound.h"

// Charts that are heard. They are made from the snapshot alone, in the language of the environment, which is
// the one that the snapshot was taken in. The chart is a node of the snapshot with a series. Main thread
// only; nothing here fails.
namespace ax::reader {

// What is said before a chart sounds, a line each: its name, what the axes show and their ranges, and whether
// its values are averaged.
std::vector<std::string> introductionOfChart(const Snapshot& snapshot, const Node& chart);

// The lowest and the highest pitch in the middle, then a note or a rest of 0.2 seconds for each of
// notesOfChart, from left to right. Empty for a chart without notes. The same for every call.
Sound notesSound(const Snapshot& snapshot, const Node& chart);

// The whole: the introduction, where a voice reads the language, and the notes.
Sound chartSound(const Snapshot& snapshot, const Node& chart);

}  // namespace ax::reader
