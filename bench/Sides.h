#pragma once

#include <benchmark/benchmark.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

// The measurements. Every operation has sides: ours, the floor, and the peers that are installed. All sides
// of one run run in one process, interleaved at random, and the median of each is compared.
namespace bench {

// Runs the operation `items` times per iteration.
struct Side {
  std::string operation;
  std::string name;  // "ours", "floor", or a peer's
  std::function<void(benchmark::State&)> body;
  std::function<void(int)> repeat;  // that many iterations
  int items = 1;
};

void addSide(Side side);
// Null when there is none.
const Side* sideOf(const std::string& operation, const std::string& name);

// Stands in a source file for each side that it brings. What the side works on is made at its first run and
// kept: were it made anew among the others, the walks would measure the holes that those left in the heap.
struct RegisteredSide {
  template <class Body>
  RegisteredSide(std::string operation, std::string name, Body once, int items = 1) {
    using Run = decltype(once());
    const auto kept = [once, made = std::make_shared<Run*>(nullptr)]() -> Run& {
      if (*made == nullptr) *made = new Run(once());
      return **made;
    };
    addSide({std::move(operation), std::move(name),
             [kept](benchmark::State& state) {
               Run& run = kept();
               for ([[maybe_unused]] auto iteration : state) run();
             },
             [kept](int times) {
               Run& run = kept();
               for (int i = 0; i < times; ++i) run();
             },
             items});
  }
};

// Nanoseconds per item; the sides of an operation in the order in which they were added.
struct Timing {
  std::string name;
  double nanoseconds = 0;
};
// Runs those that have been added since the last run.
void runSides();
std::vector<Timing> timingsOf(const std::string& operation);

// How many operations an iteration of the small ones runs.
inline constexpr int batch = 256;

}  // namespace bench
