#pragma once

#include "bundle/shared/Week.h"
#include "platform/foundation/Array.h"
#include "platform/foundation/Date.h"
#include "platform/foundation/String.h"

namespace ax {

// The names of the palette's days at one moment, in the reader's language. Main thread only.
class PaletteWeekdays {
 public:
  static PaletteWeekdays current();

  std::size_t count() const { return names_->count(); }
  // The weekday in a position, counted from 0 at the first weekday of the weekly goals; today is marked.
  Ref<String> labelAt(std::size_t position) const;

 private:
  Ref<Array> names_;  // Sunday first
  std::uint64_t firstDay_ = 1;
  std::uint64_t today_ = 1;
};

// Gives the labels of a week, Monday first, the rings of their days as values. It is the week that holds the
// date; labels beyond the seventh get none.
void fillDayValues(const Array& labels, const Date& shown);

// Which seventh of a width holds x: 0 for what lies before the first, 7 or more for what lies behind the
// last.
std::size_t sliceAt(double x, double width);

}  // namespace ax
