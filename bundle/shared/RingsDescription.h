#pragma once

#include "bundle/core/Export.h"
#include "platform/runtime/Message.h"

namespace ax {
class String;
}

// The three rings in words: each one's label, then its progress. Fractions of the goals: 1.0 is a goal
// reached, and what is negative or not a number counts as 0. `arePercentagesCapped` says that the host cut
// the fractions at 1.0, so that exactly 1.0 is spoken as a goal completed. Main thread only.
AX_EXPORT ax::Ref<ax::String> accessibilityDescriptionForPercentages(double move, double exercise,
                                                                     double stand, bool arePercentagesCapped);

namespace ax {

// Every object keeps a rings description of its own and can be asked, safely, how it describes its rings.
// The setter keeps a copy, and nil clears it. The last is nil when the receiver does not say, or raises.
namespace messages {
extern const Message<Ref<String>()> _accessibilityRingsDescription;
extern const Message<void(Ref<String>)> _accessibilitySetRingsDescription;
extern const Message<Ref<String>(double, double, double, bool)>
    _veltoUIAccessibilityDescriptionForPercentages;
}  // namespace messages

}  // namespace ax
