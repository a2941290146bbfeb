#include <cstddef>

#include "tests/fuzz/Targets.h"

// The fuzzer's one call. AXVELTO_FUZZ_TARGET is the function of the target that this program is built for.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  ax::fuzz::AXVELTO_FUZZ_TARGET({data, size});
  return 0;
}
