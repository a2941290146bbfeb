#include "platform/foundation/AttributedString.h"
#include "platform/runtime/ClassBuilder.h"

// What the app adds to the platform's String: figures with a small unit behind them.
namespace ax::host {

namespace {

Ref<AttributedString> attrStringWithValueUnit(Ref<Object> value, Ref<String> unit) {
  const std::string number = value ? value->description() : "";
  return make<AttributedString>(string(isEmpty(unit) ? number : number + " " + unit->text()));
}

struct HostExtensions {
  HostExtensions() {
    ClassBuilder<String>(String::staticClass())
        .classMethod<&attrStringWithValueUnit>("attrStringWithValue:unit:");
  }
};

const HostExtensions hostExtensions;

}  // namespace

}  // namespace ax::host
