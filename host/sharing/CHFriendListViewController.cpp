#include "host/sharing/CHFriendListViewController.h"

#include "host/core/HostStrings.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

Class& CHFriendListViewController::staticClass() {
  using T = CHFriendListViewController;
  static Class& result = ClassBuilder<T>("CHFriendListViewController", ViewController::staticClass())
                             .instanceVariable<&T::sortBarButtonItem_>("_sortBarButtonItem")
                             .method<&T::sortOrderPicked>("sortOrderPicked:")
                             .build();
  return result;
}

void CHFriendListViewController::viewDidLoad() {
  if (!sortBarButtonItem_) {
    sortBarButtonItem_ = make<BarButtonItem>();
    sortBarButtonItem_->setTitle(hostText("friends.sort.by.name"));
  }
  if (!navigationItem()->rightBarButtonItems()) navigationItem()->setRightBarButtonItem(sortBarButtonItem_);
}

void CHFriendListViewController::sortOrderPicked(Ref<String> name) {
  if (sortBarButtonItem_) sortBarButtonItem_->setTitle(std::move(name));
}

static const RegisteredClass<CHFriendListViewController> registered;

}  // namespace ax::host
