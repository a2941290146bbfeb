#include <memory>
#include <stdexcept>

#include "host/core/HostApp.h"
#include "platform/accessibility/BundleLoader.h"
#include "platform/foundation/AttributedString.h"
#include "tests/fuzz/Pieces.h"
#include "tests/tour/Samples.h"

namespace {

using namespace ax;

using PaceFunction = Ref<AccessibilityAttributedString>(const Ref<String>&);

PaceFunction* paceFunction() {
  host::linkHost();
  std::string error;
  static const auto bundle = LoadedBundle::open(tour::modulePath(), "AXVeltoGlue", error);
  if (!bundle) throw std::runtime_error(error);
  return reinterpret_cast<PaceFunction*>(
      bundle->symbol("accessibilityAttributedStringForPaceContainingString"));
}

}  // namespace

void ax::fuzz::fuzzPace(Bytes bytes) {
  static PaceFunction* const pace = paceFunction();
  const Ref<AccessibilityAttributedString> spoken = pace(string(textOf(bytes)));
  if ((spoken == nullptr) != bytes.empty()) throw std::logic_error("a text that was lost");
}
