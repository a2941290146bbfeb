#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// One friend's goals and what can be done with the friend. The user's own page looks the same, and sends no
// messages.
class CHFriendDetailCollectionViewController : public ViewController {
 public:
  static Class& staticClass();

  void viewDidLoad() override;
  void sendMessageButtonTapped(Ref<Object> sender);

 private:
  bool isMe_ = false;
  std::int64_t openedMessages_ = 0;
};

}  // namespace ax::host
