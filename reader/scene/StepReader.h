#pragma once

#include "reader/scene/JsonNode.h"
#include "reader/scene/SceneIds.h"
#include "reader/scene/SceneStep.h"

namespace ax::reader {

// Reads one STEP and declares the name of its result. Throws a Fault.
SceneStep readStep(const JsonNode& node, SceneIds& ids);

}  // namespace ax::reader
