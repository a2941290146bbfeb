#pragma once

#include <optional>
#include <string>

#include "reader/snapshot/Snapshot.h"

// Words about charts, in the language of the environment. Whatever is not known is left out. Main thread
// only.
namespace ax::reader {

// With at most two decimals.
std::string spokenFigure(double value);
// What a chart calls itself, else what its first heading says; empty where it has neither.
std::string nameOfChart(const Snapshot& snapshot, const Node& chart);
// "Chart: Heart rate"
std::string headingOf(const Snapshot& snapshot, const Node& chart);
// "hours". A chart may give a unit as its sign; it is told by its name where it has one.
std::string unitName(const DataSeriesAxis& axis);
// "Unit: hours"
std::string unitOf(const DataSeriesAxis& axis);
// "from 0 to 24"
std::string rangeOf(std::optional<double> minimum, std::optional<double> maximum);

}  // namespace ax::reader
