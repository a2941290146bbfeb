#include "host/core/HostStrings.h"
#include "platform/foundation/AttributedString.h"
#include "platform/runtime/ClassBuilder.h"

// What the app adds to the platform's String: figures with a small unit behind them.
namespace ax::host {

namespace {

Ref<AttributedString> attrStringWithValueUnit(Ref<Object> value, Ref<String> unit) {
  return make<AttributedString>(hostText("value.with.unit", {value, unit}));
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
