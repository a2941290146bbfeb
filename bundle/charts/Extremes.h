#pragma once

#include <limits>

namespace ax {

// The smallest and the largest of some figures. Both start far outside: the smallest at the largest double,
// the largest at the smallest positive one, so that figures of 0 and less never become the largest.
struct Extremes {
  static constexpr double noMinimum = std::numeric_limits<double>::max();
  static constexpr double noMaximum = std::numeric_limits<double>::min();

  double minimum = noMinimum;
  double maximum = noMaximum;

  void include(double figure) {
    if (figure > maximum) maximum = figure;
    if (figure < minimum) minimum = figure;
  }
  bool isIncomplete() const { return minimum == noMinimum || maximum == noMaximum; }
};

}  // namespace ax
