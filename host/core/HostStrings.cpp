#include "host/core/HostStrings.h"

#include "platform/foundation/Bundle.h"
#include "platform/foundation/Formatters.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::host {

namespace {

const char inThisModule = 0;

Class& makeClass() {
  using T = HostStrings;
  Class& made = ClassBuilder<T>("HostStrings", Object::staticClass())
                    .classMethod<&T::textForKey>("textForKey:")
                    .build();
  setBundleOfClass(made, &inThisModule, "../share/axvelto");
  return made;
}

}  // namespace

Class& HostStrings::staticClass() {
  static Class& result = makeClass();
  return result;
}

Ref<String> HostStrings::textForKey(const Ref<String>& key) {
  if (!key) return nullptr;
  return Bundle::bundleForClass(&staticClass())->localizedStringForKey(key->text(), nullptr, "Host");
}

Ref<String> hostText(std::string_view key, std::initializer_list<Ref<Object>> arguments) {
  const Ref<String> text = HostStrings::textForKey(string(std::string(key)));
  if (!text) return emptyString();
  return arguments.size() == 0 ? text : stringWithFormat(text, arguments);
}

static const RegisteredClass<HostStrings> registered;

}  // namespace ax::host
