#pragma once

#include "platform/toolkit/ViewController.h"

namespace ax::host {

// What friends have sent, and a button that writes to them.
class CHFriendInboxTableViewController : public ViewController {
 public:
  static Class& staticClass();

  void viewDidLoad() override;
  void sendMessageButtonTapped(Ref<Object> sender);

 private:
  std::int64_t openedMessages_ = 0;
};

}  // namespace ax::host
