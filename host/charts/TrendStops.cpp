#include "host/charts/TrendStops.h"

#include "platform/runtime/Number.h"

namespace ax::host {

Ref<Array> evenStops(std::size_t columns, double width) {
  Array::Items stops;
  for (std::size_t i = 0; i < columns; ++i) {
    stops.push_back(number(width * static_cast<double>(i) / static_cast<double>(columns)));
  }
  return array(std::move(stops));
}

}  // namespace ax::host
