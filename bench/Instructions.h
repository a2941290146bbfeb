#pragma once

#include <string>
#include <vector>

#include "bench/Report.h"

// Instructions instead of time: they are the same on every machine. Counted by valgrind's callgrind, each as
// the difference between two runs of this program that differ in nothing but how often they do a thing.
namespace bench {

// Takes a minute. What cannot be counted, also for want of valgrind, is told in the notes.
void compareInstructions(const std::string& program, std::vector<Row>& rows, std::vector<std::string>& notes);

// What such a run does: one side, that often. False when there is no such side.
bool repeatSide(const std::string& program, const std::string& operation, const std::string& side, int times);

}  // namespace bench
