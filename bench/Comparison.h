#pragma once

#include <optional>
#include <string>
#include <vector>

#include "bench/Report.h"

// Rows made of the timings that have been taken. Costs are per item of an operation.
namespace bench {

// What is compared, and how large the ratios may be: to the floor, and to every peer.
struct Operation {
  std::string name;
  std::string title;
  std::optional<double> boundToFloor = {};
  std::optional<double> boundToPeers = {};
};
void compare(const Operation& operation, std::vector<Row>& rows);

// How much more an item costs in the larger operation than in the smaller one, beside the same of the floor:
// what memory costs both alike is not ours.
struct Growth {
  std::string title;
  std::string small;
  std::string large;
  std::optional<double> bound = {};
};
void compareGrowth(const Growth& growth, std::vector<Row>& rows);

}  // namespace bench
