#include "host/sharing/CHFriendDetailCollectionViewController.h"

#include "host/sharing/MessageButton.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHFriendDetailCollectionViewController::staticClass() {
  using T = CHFriendDetailCollectionViewController;
  static Class& result =
      ClassBuilder<T>("CHFriendDetailCollectionViewController", ViewController::staticClass())
          .instanceVariable<&T::isMe_>("_isMe")
          .instanceVariable<&T::openedMessages_>("_openedMessages")
          .method<&T::sendMessageButtonTapped>("_sendMessageButtonTapped:")
          .build();
  return result;
}

void CHFriendDetailCollectionViewController::viewDidLoad() {
  if (!isMe_) addMessageButton(*this);
}

void CHFriendDetailCollectionViewController::sendMessageButtonTapped(Ref<Object>) {
  ++openedMessages_;
}

static const RegisteredClass<CHFriendDetailCollectionViewController> registered;

}  // namespace ax::host
