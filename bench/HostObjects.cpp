#include "bench/HostObjects.h"

#include <cstdio>
#include <cstdlib>
#include <string>

namespace bench {

void check(bool condition, const char* what) {
  if (condition) return;
  std::fprintf(stderr, "axvelto-bench: %s\n", what);
  std::exit(1);
}

ax::Ref<ax::Object> hostObject(std::string_view className) {
  const ax::Class* hostClass = ax::Class::named(className);
  check(hostClass != nullptr, std::string(className).c_str());
  return hostClass->instantiate();
}

void setMember(ax::Object& object, ax::Key key, const ax::Ref<ax::Object>& value) {
  const ax::InstanceVariable* variable = object.isa().instanceVariable(key);
  check(variable != nullptr && variable->write(object, value), "a member of a host object is not there");
}

}  // namespace bench
