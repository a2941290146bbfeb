#include "platform/foundation/AddressBook.h"

#include "platform/foundation/Environment.h"

namespace ax {

Ref<String> copyUserFirstNameFromAddressBook() {
  const std::string& name = environment().firstName;
  return name.empty() ? nullptr : string(name);
}

}  // namespace ax
