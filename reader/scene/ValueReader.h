#pragma once

#include "reader/scene/JsonNode.h"
#include "reader/scene/SceneIds.h"
#include "reader/scene/SceneValue.h"

namespace ax::reader {

// Reads one VALUE, and what stands inside it. Throws a Fault.
SceneValue readValue(const JsonNode& node, SceneIds& ids);
std::vector<SceneValue> readValues(const JsonNode& array, SceneIds& ids);

}  // namespace ax::reader
