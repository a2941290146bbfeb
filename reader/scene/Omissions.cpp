#include "reader/scene/Omissions.h"

#include "platform/runtime/Class.h"
#include "reader/scene/HostNames.h"

namespace ax::reader {

namespace {

bool hasMember(const Class& line, const std::string& member) {
  const Selector selector = Selector::find(member);
  return line.conformsTo(member) ||
         (selector && (line.instanceVariableEvenIfHidden(selector) != nullptr ||
                       answersMethod(line, selector) || answersMethod(line.metaclass(), selector)));
}

}  // namespace

void checkOmission(const HostOmission& omission, const std::string& file) {
  const auto [owner, member] = classAndMember(omission.name);
  if (owner == nullptr) {
    throw Fault{file, omission.place, "no class for \"" + omission.name + "\"", "Class or Class.member"};
  }
  if (member.empty() || hasMember(*owner, member)) return;
  throw Fault{file, omission.place, "unknown member \"" + member + "\"",
              "a member, method, class method or protocol of class " + owner->name()};
}

void takeAway(const std::string& name) {
  const auto [owner, member] = classAndMember(name);
  if (member.empty()) {
    owner->hide();
    return;
  }
  for (Class* c = owner; c != nullptr && !c->hideMember(member); c = c->superclass()) continue;
}

}  // namespace ax::reader
