#pragma once

#include "platform/runtime/Class.h"

namespace bench {

// A host object by its class's name, and a member of it by its own. A name that is wrong ends the process.
ax::Ref<ax::Object> hostObject(std::string_view className);
void setMember(ax::Object& object, ax::Key key, const ax::Ref<ax::Object>& value);

// For what has to hold before anything is measured; ends the process with a message when it does not.
void check(bool condition, const char* what);

}  // namespace bench
