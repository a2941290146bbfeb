#pragma once

#include "platform/foundation/String.h"

namespace ax::host {

// Somebody who shares activity with the user.
class Friend : public Object {
 public:
  static Class& staticClass();

  const Ref<String>& name() const { return name_; }
  bool hasNews() const { return hasNews_; }
  bool isCompeting() const { return isCompeting_; }

 private:
  Ref<String> name_;
  bool hasNews_ = false;      // something that the user has not seen yet
  bool isCompeting_ = false;  // a competition with the user is in progress
};

// A friend's day in two lines, as a row shows it; either may be nil.
class FriendSnapshot : public Object {
 public:
  static Class& staticClass();

  const Ref<String>& lineOne() const { return lineOne_; }
  const Ref<String>& lineTwo() const { return lineTwo_; }

 private:
  Ref<String> lineOne_;
  Ref<String> lineTwo_;
};

}  // namespace ax::host
