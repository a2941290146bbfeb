#include "host/core/HostStrings.h"

#include "platform/foundation/Bundle.h"
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

static const RegisteredClass<HostStrings> registered;

}  // namespace ax::host
