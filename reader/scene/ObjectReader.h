#pragma once

#include "reader/scene/JsonNode.h"
#include "reader/scene/SceneIds.h"
#include "reader/scene/SceneValue.h"

namespace ax::reader {

// Reads one OBJECT and checks it against its class. Throws a Fault.
SceneObject readObject(const JsonNode& node, SceneIds& ids);

// The members of a `set`; checked against the class when it is known.
std::vector<SceneMember> readMembers(const JsonNode& node, const Class* declaring, SceneIds& ids);

}  // namespace ax::reader
