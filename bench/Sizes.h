#pragma once

namespace bench {

// Bytes of the heap, as the allocator counts them.
struct Sizes {
  double object = 0;
  double storedValue = 0;
  double view = 0;
};
Sizes measureSizes();

}  // namespace bench
