#pragma once

#include <cstdint>

#include "platform/formatting/Region.h"

namespace ax::formatting {

// A value that follows from the current region, kept until the region changes. Main thread only.
template <class T>
class PerRegion {
 public:
  // `make` is called for the value when there is none for this region. What is returned lasts until the next
  // call in another region.
  template <class Make>
  T& get(Make make) {
    if (generation_ != regionGeneration()) {
      value_ = make();
      generation_ = regionGeneration();
    }
    return value_;
  }

 private:
  T value_{};
  std::uint64_t generation_ = 0;  // no region's
};

}  // namespace ax::formatting
