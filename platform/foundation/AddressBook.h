#pragma once

#include "platform/foundation/String.h"

namespace ax {

// The user's first name; nil when it is not known. Main thread only.
Ref<String> copyUserFirstNameFromAddressBook();

}  // namespace ax
