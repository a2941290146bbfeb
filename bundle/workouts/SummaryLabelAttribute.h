#pragma once

#include "platform/foundation/String.h"
#include "platform/runtime/Message.h"

// A summary's figures may be marked to be spoken in their own way: the container keeps the name of the
// attribute, nil for none, and puts it on its total and its average.
namespace ax::messages {

inline constinit const Message<Ref<String>()> _accessibilityLabelAttribute{"_accessibilityLabelAttribute"};
inline constinit const Message<void(Ref<String>)> _accessibilitySetLabelAttribute{
    "_accessibilitySetLabelAttribute:"};

}  // namespace ax::messages
