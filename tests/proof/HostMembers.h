#pragma once

#include <string>
#include <vector>

#include "platform/runtime/Class.h"

namespace ax::proof {

// What a member answers, as far as faults of it differ.
enum class MemberKind { object, array, number, scalar, flag, geometry, nothing };

// A member of the host as it is reached by name: an instance variable, or a method of a class or its
// metaclass.
struct HostMember {
  Class* declaring;
  Selector selector;
  const InstanceVariable* variable;  // or
  const Method* method;
  MemberKind kind;

  std::string name() const;  // "CHCell._titleLabel", "+CHCell.sharedInstance"
};

// Every member of the classes that stand before the module is opened, and whose name stands in the module.
// What the module does not name, it can neither read nor call.
std::vector<HostMember> membersNamedIn(const std::string& module, const std::vector<Class*>& classes);

}  // namespace ax::proof
