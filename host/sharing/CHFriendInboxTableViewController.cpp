#include "host/sharing/CHFriendInboxTableViewController.h"

#include "host/sharing/MessageButton.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHFriendInboxTableViewController::staticClass() {
  using T = CHFriendInboxTableViewController;
  static Class& result = ClassBuilder<T>("CHFriendInboxTableViewController", ViewController::staticClass())
                             .instanceVariable<&T::openedMessages_>("_openedMessages")
                             .method<&T::sendMessageButtonTapped>("_sendMessageButtonTapped:")
                             .build();
  return result;
}

void CHFriendInboxTableViewController::viewDidLoad() {
  addMessageButton(*this);
}

void CHFriendInboxTableViewController::sendMessageButtonTapped(Ref<Object>) {
  ++openedMessages_;
}

static const RegisteredClass<CHFriendInboxTableViewController> registered;

}  // namespace ax::host
