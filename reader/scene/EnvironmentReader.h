#pragma once

#include "reader/scene/JsonNode.h"
#include "reader/scene/SceneEnvironment.h"

namespace ax::reader {

// Reads the members of an environment. Throws a Fault.
SceneEnvironment readEnvironment(const JsonNode& node);

}  // namespace ax::reader
