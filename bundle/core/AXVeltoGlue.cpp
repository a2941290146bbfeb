#include "bundle/core/AXVeltoGlue.h"

#include <array>
#include <mutex>
#include <utility>

#include "bundle/core/InstallationList.h"
#include "platform/accessibility/ValidationManager.h"
#include "platform/foundation/Bundle.h"
#include "platform/foundation/Environment.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

constexpr std::string_view bundleName = "AX Velto";

constexpr auto categories = []<std::size_t... Place>(std::index_sequence<Place...>) {
  return std::array{&categoryAt<Place>...};
}
(std::make_index_sequence<installationList.size()>());

// What the look-up of a day's summary needs of the host, and the screens that do it.
bool validateHost(ValidationManager& manager) {
  manager.validateClassHasClassMethodWithFullSignature("Calendar", "qs_gregorianCalendarWithUTCTimeZone",
                                                       {"@"});
  manager.validateClassHasInstanceMethodWithFullSignature("ActivitySummaryCache",
                                                          "activitySummaryForCacheIndex:", {"@", "q"});
  manager.validateClassHasInstanceMethodWithFullSignature("ActivitySummary",
                                                          "_exerciseTimeCompletionPercentage", {"d"});
  return true;
}

bool introduceBundle(ValidationManager& manager) {
  manager.setValidationTargetName(string(std::string(bundleName)));
  manager.setOverrideProcessName(string(std::string(bundleName)));
  manager.setValidationTargetScreens({"Month calendar", "Week palette", "Day list"});
  manager.setDebugBuild(false);
  return performValidationChecks();
}

void installCategories(ValidationManager& manager) {
  for (const auto category : categories) registerCategory(category());
  for (const InstallationRow& row : installationList) {
    manager.installSafeCategoryCanInteractWithTargetClass(row.category, true);
  }
}

void startUp() {
  ValidationManager::sharedInstance()
      ->performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
          validateHost, introduceBundle, nullptr, installCategories);
}

}  // namespace

Class& AXVeltoGlue::staticClass() {
  static Class& result =
      ClassBuilder<AXVeltoGlue>("AXVeltoGlue", Object::staticClass())
          .classMethod<&AXVeltoGlue::accessibilityBundles>("accessibilityBundles")
          .classMethod<&AXVeltoGlue::accessibilityInitializeBundle>("accessibilityInitializeBundle")
          .build();
  return result;
}

void AXVeltoGlue::accessibilityInitializeBundle() {
  static std::once_flag started;
  std::call_once(started, startUp);
}

namespace {

struct ResourcesBesideModule {
  ResourcesBesideModule() {
    static const char inThisModule = 0;
    setBundleOfClass(AXVeltoGlue::staticClass(), &inThisModule, "resources");
  }
};

const ResourcesBesideModule resourcesBesideModule;

}  // namespace

}  // namespace ax

// The principal class object, under its own name.
AX_EXPORT ax::Class* AXVeltoGlue() {
  return &ax::AXVeltoGlue::staticClass();
}
