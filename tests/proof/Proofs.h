#pragma once

#include <cstddef>
#include <string>

namespace ax::proof {

// Which trials are run: every `of`th from `part` on, of those whose name holds the words.
struct Selection {
  std::size_t part = 0;
  std::size_t of = 1;
  std::string words;  // "CHCell._titleLabel nil"; empty: all
};

// Each prints what it has tried and every fault it found, with the command that shows it again, and answers
// whether there was none.
bool proveFaults(const Selection& selection);
bool proveLifetimes();

}  // namespace ax::proof
