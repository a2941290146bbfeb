#pragma once

#include "reader/picture/ChartDrawing.h"
#include "reader/picture/Markup.h"

namespace ax::reader {

// Writes the bars or lines of a chart and its axes as SVG elements.
void addChartShapes(Markup& svg, const ChartDrawing& drawing);

}  // namespace ax::reader
