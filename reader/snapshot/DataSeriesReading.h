#pragma once

#include <optional>

#include "reader/snapshot/DataSeries.h"
#include "reader/snapshot/HostQuestions.h"

namespace ax::reader {

// What a live chart says of itself, asked once; nothing when the object is no chart: neither a data series
// container nor one that is to be described by slices.
std::optional<DataSeries> readDataSeries(Object& object, HostQuestions& questions);

}  // namespace ax::reader
