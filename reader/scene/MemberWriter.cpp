#include "reader/scene/MemberWriter.h"

#include <array>

#include "platform/runtime/Class.h"
#include "platform/runtime/Signature.h"
#include "reader/scene/HostNames.h"
#include "reader/scene/ValueKind.h"

namespace ax::reader {

namespace {

std::string classOf(const Ref<Object>& value) {
  return value ? "a value of class " + value->isa().name() : "null";
}

std::string expectedFor(const std::string& type) {
  return Class::namedEvenIfHidden(type) != nullptr ? "a value of class " + type : kindInWords(type);
}

}  // namespace

void writeMember(Object& object, const std::string& key, const Ref<Object>& value, const std::string& place,
                 const std::string& file) {
  const Class& declaring = object.isa();
  if (const InstanceVariable* variable = declaring.instanceVariableEvenIfHidden(Selector::intern(key))) {
    const std::string type = variable->type();
    const bool isObject = Class::namedEvenIfHidden(type) != nullptr;
    if ((isObject || fits(value, type)) && variable->write(object, value)) return;
    throw Fault{file, place, classOf(value) + " for " + key, expectedFor(type)};
  }
  const Selector setter = Selector::intern(setterName(key));
  const Method& method = declaring.lookUp(setter);
  if (method.function == nullptr && declaring.hasHiddenMember(setter)) return;
  if (method.function == nullptr || method.signature->encodings.size() != 2) {
    throw Fault{file, place, "unknown member \"" + key + "\"", "a member of class " + declaring.name()};
  }
  const std::array arguments = {value};
  const std::string_view code = method.signature->encodings[1];
  if (!fits(value, code) || (method.takes != nullptr && !method.takes(arguments))) {
    throw Fault{file, place, classOf(value) + " for " + key, kindInWords(code)};
  }
  method.signature->invoke(object, method, arguments);
}

}  // namespace ax::reader
