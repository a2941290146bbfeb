#pragma once

#include <optional>
#include <string>
#include <vector>

namespace bench {

// One row of the comparison: a figure of ours against one other, and how large their ratio may be.
struct Row {
  std::string operation;
  std::string unit;
  double ours = 0;
  std::string against;
  double other = 0;
  // At most this many times the other; below 1 where ours has to be that much faster. None: for information.
  std::optional<double> bound = {};

  double ratio() const { return other == 0 ? 0 : ours / other; }
  bool isMet() const { return !bound || ours <= *bound * other; }
};

std::string asText(const std::vector<Row>& rows, const std::vector<std::string>& notes);
std::string asJson(const std::vector<Row>& rows, const std::vector<std::string>& notes);

}  // namespace bench
