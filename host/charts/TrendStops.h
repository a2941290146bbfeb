#pragma once

#include <stdexcept>
#include <string>

#include "platform/foundation/Array.h"

namespace ax::host {

// The left edges of columns that share a width evenly, as Numbers.
Ref<Array> evenStops(std::size_t columns, double width);

// The item when it is there and one of T. Raises for a bad index, as the app does.
template <class T>
const T& itemAt(const Ref<Array>& items, std::int32_t index) {
  const Ref<Object> item = items && index >= 0 ? items->at(static_cast<std::size_t>(index)) : nullptr;
  const T* found = cast<T>(item.get());
  if (found == nullptr) throw std::out_of_range("no item at index " + std::to_string(index));
  return *found;
}

}  // namespace ax::host
