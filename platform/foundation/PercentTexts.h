#pragma once

#include <array>
#include <cmath>

#include "platform/formatting/PerRegion.h"
#include "platform/foundation/String.h"

namespace ax {

// The texts of whole percents in the current region, each written once: a month of rings says the same few
// again and again. Main thread only.
class PercentTexts {
 public:
  // The text of a fraction rounded to whole percents. `write` makes it of a fraction; it is asked for all
  // that is not remembered: what is negative, large or no number, and what lies so near between two that it
  // must round. The text is shared by all who ask for it.
  template <class Write>
  Ref<String> text(double fraction, Write write) {
    const double percent = fraction * 100;
    const double whole = std::round(percent);
    const bool isRemembered = whole >= 0 && whole < most && std::abs(percent - whole) < nearHalf;
    if (!isRemembered) return write(fraction);
    Ref<String>& text = texts_.get([] { return Texts(); })[static_cast<std::size_t>(whole)];
    if (!text) text = write(whole / 100);
    return text;
  }

 private:
  static constexpr std::size_t most = 201;
  static constexpr double nearHalf = 0.499;
  using Texts = std::array<Ref<String>, most>;

  formatting::PerRegion<Texts> texts_;
};

}  // namespace ax
