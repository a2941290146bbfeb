#pragma once

#include <functional>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "platform/foundation/String.h"
#include "platform/runtime/Object.h"

namespace ax {

struct CategoryGraft;

enum class CheckKind {
  classExists,
  kindOfClass,
  instanceVariable,
  instanceMethod,
  classMethod,
  protocol,
  // What installation found: a category's override was left out, since the host's method is of another type.
  overriddenMethod,
  overriddenClassMethod
};

// One check of the host contract and what came of it.
struct ContractCheck {
  CheckKind kind;
  std::string category;   // whose check it is; empty for a check of the bundle as a whole
  std::string className;  // the class that was checked
  std::string member;     // the member, protocol or base class; empty for a class's mere existence
  std::string expected;   // the type, signature, or presence that was asked for
  std::string found;      // what the host has
  bool passed;

  // "Velto.TrendListMetricView has instance method trendString"
  std::string description() const;
};

struct InstallationRequest {
  std::string category;
  bool canInteractWithTargetClass;
  bool installed;  // false when the category or its target is missing, or it was before
};

// Checks host contracts and installs safe categories. There is one for the process; it is used on the thread
// that runs start-up and may be read once that is over. A check that fails is recorded and never stops
// anything; a category whose checks failed is installed all the same, and says less. An override that the
// host answers with another type is left to the host, or to the category that added such a method, and
// recorded as a failed check, whether checks run or not.
class ValidationManager final : public Object {
 public:
  using BoolHandler = std::function<bool(ValidationManager&)>;
  using Handler = std::function<void(ValidationManager&)>;
  using FullSignature =
      std::initializer_list<std::string_view>;  // type codes: the result, then the arguments

  static Class& staticClass();
  static Ref<ValidationManager> sharedInstance();

  // Runs the pre-validation handler, then the validations (if the former says that checks are to run), the
  // post-validation handler, which may be null, and the installation.
  void performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
      const BoolHandler& validations, const BoolHandler& preValidation, const Handler& postValidation,
      const Handler& installation);

  void setValidationTargetName(const Ref<String>& name);
  void setOverrideProcessName(const Ref<String>& name);
  // The screens that rely on the checks of no category.
  void setValidationTargetScreens(std::vector<std::string> screens) { targetScreens_ = std::move(screens); }
  void setDebugBuild(bool isDebugBuild) { isDebugBuild_ = isDebugBuild; }
  const std::string& validationTargetName() const { return targetName_; }
  const std::vector<std::string>& validationTargetScreens() const { return targetScreens_; }
  const std::string& overrideProcessName() const { return processName_; }
  bool isDebugBuild() const { return isDebugBuild_; }

  // The checks. Method names are compared with blanks removed. Each answers whether it holds.
  bool validateClass(std::string_view className);
  bool validateClassIsKindOfClass(std::string_view className, std::string_view baseName);
  bool validateClassHasInstanceVariableWithType(std::string_view className, std::string_view variable,
                                                std::string_view type);
  bool validateClassHasInstanceMethodWithFullSignature(std::string_view className, std::string_view method,
                                                       FullSignature signature);
  bool validateClassHasClassMethodWithFullSignature(std::string_view className, std::string_view method,
                                                    FullSignature signature);
  bool validateClassConformsToProtocol(std::string_view className, std::string_view protocol);

  // Looks up the category and its target by name, runs the category's checks, and grafts it.
  void installSafeCategoryCanInteractWithTargetClass(std::string_view category, bool canInteract);

  const std::vector<ContractCheck>& checks() const { return checks_; }
  std::vector<ContractCheck> failedChecks() const;
  const std::vector<InstallationRequest>& installationRequests() const { return requests_; }
  std::size_t starts() const { return starts_; }  // how often start-up was asked for

 private:
  bool record(ContractCheck check);
  bool checkMethod(CheckKind kind, std::string_view className, std::string_view method,
                   FullSignature signature);
  bool installCategory(std::string_view name);
  void recordLeftToHost(const CategoryGraft& graft);

  std::string targetName_;
  std::vector<std::string> targetScreens_;
  std::string processName_;
  bool isDebugBuild_ = false;
  bool runsChecks_ = true;
  std::size_t starts_ = 0;
  std::string currentCategory_;
  std::vector<ContractCheck> checks_;
  std::vector<InstallationRequest> requests_;
};

}  // namespace ax
