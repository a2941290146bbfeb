#pragma once

#include <string>

#include "reader/picture/ReadingOrder.h"

// Pictures of a snapshot as SVG documents that stand alone: nothing is loaded, and colours are attributes, so
// that a style sheet around an embedded picture can give others by class. Main thread only.
namespace ax::reader {

// A screen: the frame of every element with its number in the reading order, a row of numbers above the
// screen for those without a frame, containers as thin outlines, and charts with their bars or lines. One
// unit is one point of the screen. The title names the picture.
std::string screenPicture(const Snapshot& snapshot, const ReadingOrder& order, const std::string& title);

// One chart of a snapshot, larger, with its axes, their titles and ends. `name` names the picture.
std::string chartPicture(const Snapshot& snapshot, const Node& chart, const std::string& name);
std::string chartPicture(const DataSeries& series, const std::string& name);

}  // namespace ax::reader
