#pragma once

#include <cstdint>

#include "platform/foundation/Formatters.h"

namespace ax {

// The equal spans of the current day as a listener hears them, such as "6 – 9 AM". Made per build of a
// chart's elements; it holds one formatter for all of them. Main thread only.
class DaySpans {
 public:
  // The step is in seconds; the template is that of every span but the last. It must outlive the spans.
  DaySpans(TimeInterval step, std::string_view dateTemplate);

  // The span with that index from the day's start, in the current zone; it may lie past midnight. The last
  // one of a chart ends a second short of the next, and shows its minutes.
  Ref<String> text(std::size_t index, bool isLast);

 private:
  TimeInterval step_;
  std::string_view template_;
  Ref<Date> dayStart_;
  Ref<DateIntervalFormatter> formatter_;
};

}  // namespace ax
