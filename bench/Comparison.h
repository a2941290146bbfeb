#pragma once

#include <optional>
#include <string>
#include <vector>

#include "bench/Report.h"

// Rows made of the timings that have been taken. Costs are per item of an operation.
namespace bench {

// How large the ratio to one side may be.
struct Bound {
  std::string side;
  double ratio = 1;
};

// What is compared, and the bounds that there are.
struct Operation {
  std::string name;
  std::string title;
  std::vector<Bound> bounds = {};
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
