// Counters for benches and tests: warm formatting must make no formatter.
#pragma once

#include <cstddef>
#include <cstdint>

namespace ax::formatting {

// Formatters and compiled patterns made since the process started.
std::uint64_t formattersMade();

// Formatters held at this moment; never more than the cache's capacity of 256.
std::size_t formattersHeld();

}  // namespace ax::formatting
