#pragma once

#include <string>

#include "platform/runtime/Object.h"
#include "reader/text/Fault.h"

namespace ax::reader {

// Writes a member: the instance variable of this very name, else what the setter "set<Key>:" sets. Members
// that were taken away are written too, except that a setter which is gone is not missed. Throws a Fault for
// a member that there is not, and for a value of another kind than it takes; what a setter raises passes
// through.
void writeMember(Object& object, const std::string& key, const Ref<Object>& value, const std::string& place,
                 const std::string& file);

}  // namespace ax::reader
