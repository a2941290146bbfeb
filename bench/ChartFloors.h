#pragma once

#include <string>
#include <vector>

#include "bench/IcuFormats.h"

// The texts of the charts, straight from ICU. Each holds its formatters, and its texts until the next time,
// as a chart holds its elements.
namespace bench {

using Texts = std::vector<std::string>;

struct MoveChartTexts {
  IcuIntervals spans{"ha"};
  IcuIntervals lastSpan{"hmma"};
  IcuNumbers figures = IcuNumbers::decimals(0);
  IcuMessage calories{"{0, select, 1 {{0} calorie} other {{0} calories}}"};

  Texts kept = {};

  void write(int count);
};

struct StandChartTexts {
  IcuIntervals hours{"ha"};
  IcuIntervals lastHour{"hmma"};

  Texts kept = {};

  void write(int count);
};

struct TrendChartTexts {
  IcuIntervals days{"MMMMdyyyy"};
  IcuNumbers figures = IcuNumbers::decimals(2);

  Texts kept = {};

  void write(int count);
};

// What the bars of the charts stand for, for the host and for the floor alike.
double moveOfSpan(int span);
double figureOfBar(int bar);
double startOfBar(int bar, int count);

}  // namespace bench
