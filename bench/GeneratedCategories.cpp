#include "bench/GeneratedCategories.h"

#include <algorithm>
#include <array>
#include <utility>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/toolkit/Label.h"

namespace bench {

namespace {

using namespace ax;

constexpr int categories = 65;

template <int N>
class Cell : public View {
 public:
  static std::string name() { return "Bench.Cell" + std::to_string(N); }
  static Class& staticClass() {
    static Class& result = ClassBuilder<Cell>(name(), View::staticClass())
                               .template instanceVariable<&Cell::title>("_titleLabel")
                               .template instanceVariable<&Cell::value>("_valueLabel")
                               .template instanceVariable<&Cell::isCurrent>("_isCurrent")
                               .template method<&Cell::reload>("reloadWithTitle:")
                               .template method<&Cell::fraction>("completionFraction")
                               .build();
    return result;
  }
  void reload(Ref<String> text) { title->setText(text); }
  double fraction() { return N; }

 private:
  Ref<Label> title = make<Label>();
  Ref<Label> value = make<Label>();
  bool isCurrent = false;
};

template <int N>
class CellAccessibility : public SafeCategory {
 public:
  static void _accessibilityPerformValidations(const Contract& contract) {
    contract.isKindOf("View");
    contract.instanceVariable("_titleLabel", "Label");
    contract.instanceVariable("_valueLabel", "Label");
    contract.instanceVariable("_isCurrent", "B");
    contract.instanceMethod("reloadWithTitle:", {"v", "@"});
    contract.instanceMethod("completionFraction", {"d"});
  }
  bool isAccessibilityElement() { return true; }
  Ref<String> accessibilityLabel() { return super(messages::accessibilityLabel); }
  Ref<String> accessibilityValue() { return super(messages::accessibilityValue); }
  Traits accessibilityTraits() { return super(messages::accessibilityTraits) | TraitButton; }
  void layoutSubviews() { super(messages::layoutSubviews); }
};

template <int N>
void registerOne() {
  using C = CellAccessibility<N>;
  Cell<N>::staticClass();
  static constexpr std::array all = {overrides<&C::isAccessibilityElement>(messages::isAccessibilityElement),
                                     overrides<&C::accessibilityLabel>(messages::accessibilityLabel),
                                     overrides<&C::accessibilityValue>(messages::accessibilityValue),
                                     overrides<&C::accessibilityTraits>(messages::accessibilityTraits),
                                     overrides<&C::layoutSubviews>(messages::layoutSubviews)};
  static const std::string target = Cell<N>::name();
  static const std::string name = target + "Accessibility";
  static const CategoryRecord record{name, target, "Bench", &C::_accessibilityPerformValidations, all};
  registerCategory(record);
}

template <int... N>
void registerAll(std::integer_sequence<int, N...>) {
  (registerOne<N>(), ...);
}

bool accept(ValidationManager&) {
  return true;
}

void installAll(ValidationManager& manager) {
  for (int i = 0; i < categories; ++i) {
    manager.installSafeCategoryCanInteractWithTargetClass("Bench.Cell" + std::to_string(i) + "Accessibility",
                                                          true);
  }
}

}  // namespace

void registerGeneratedCategories() {
  registerAll(std::make_integer_sequence<int, categories>());
}

int installGeneratedCategories() {
  ValidationManager& manager = *ValidationManager::sharedInstance();
  manager.performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
      accept, accept, nullptr, installAll);
  const auto& requests = manager.installationRequests();
  const bool allHold = manager.failedChecks().empty();
  return allHold ? static_cast<int>(std::count_if(requests.begin(), requests.end(),
                                                  [](const auto& request) { return request.installed; }))
                 : -1;
}

}  // namespace bench
