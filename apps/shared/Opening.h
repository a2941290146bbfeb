#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace ax::app {

// What is to be opened, and how.
struct Opening {
  std::vector<std::string> files;    // paths, or "-" for standard input
  std::string locale;                // empty: the scene's
  std::string timeZone;              // empty: the scene's, or of the clock that a workout file was written by
  bool readsDamaged = false;         // reads a damaged workout file as far as it goes
  std::size_t workout = 0;           // which one of a file with several, from 1 on; 0: all
  std::vector<std::string> without;  // classes and members that the host does without
};

}  // namespace ax::app
