#pragma once

#include <functional>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/runtime/Object.h"

namespace ax::reader {

// The id of an object; empty for none.
using IdOf = std::function<std::string(const Object&)>;

// An object, or nil, as JSON: texts, numbers, arrays, dates, units, quantities, geometry and selectors by
// their content, everything that is shown on the screen by its accessibility properties, and the rest by id
// and class. Asking for a property may raise.
nlohmann::ordered_json replyAsJson(const Ref<Object>& reply, const IdOf& idOf);

}  // namespace ax::reader
