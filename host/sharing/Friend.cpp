#include "host/sharing/Friend.h"

#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& Friend::staticClass() {
  static Class& result = ClassBuilder<Friend>("Friend", Object::staticClass())
                             .instanceVariable<&Friend::name_>("name")
                             .instanceVariable<&Friend::hasNews_>("hasNews")
                             .instanceVariable<&Friend::isCompeting_>("isCompeting")
                             .build();
  return result;
}

Class& FriendSnapshot::staticClass() {
  static Class& result = ClassBuilder<FriendSnapshot>("FriendSnapshot", Object::staticClass())
                             .instanceVariable<&FriendSnapshot::lineOne_>("lineOne")
                             .instanceVariable<&FriendSnapshot::lineTwo_>("lineTwo")
                             .build();
  return result;
}

static const RegisteredClass<Friend> registered;
static const RegisteredClass<FriendSnapshot> registeredSnapshot;

}  // namespace ax::host
