#pragma once

#include <optional>
#include <string>

#include "reader/snapshot/Node.h"

// Words about charts, in the language of the environment. Main
// thread only. Whatever is not known is left out.
namespace ax::reader {

// With at most two decimals.
std::string spokenFigure(double value);
// With its times in words; empty for nil.
std::string chartText(const std::optional<AttributedText>& text);
// "Chart: Heart rate"
std::string headingOf(const Node& chart);
// "Unit: hours"
std::string unitOf(const DataSeriesAxis& axis);
// "from 0 to 24"
std::string rangeOf(std::optional<double> minimum, std::optional<double> maximum);

}  // namespace ax::reader
