#pragma once

#include <cstdint>
#include <string>

namespace bench {

inline constexpr int walkSizes[] = {1'000, 10'000, 100'000};
inline constexpr int childrenPerRow = 9;

// What a walk adds up, so that no answer is left out.
struct Sums {
  std::size_t bytes = 0;
  std::uint64_t traits = 0;
  double right = 0;
};

inline std::string walkName(int nodes) {
  return "walk " + std::to_string(nodes);
}

}  // namespace bench
