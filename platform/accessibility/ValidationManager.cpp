#include "platform/accessibility/ValidationManager.h"

#include <algorithm>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/base/NeverDestroyed.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Grafting.h"

namespace ax {

namespace {

std::string withoutBlanks(std::string_view name) {
  std::string result(name);
  std::erase(result, ' ');
  return result;
}

template <class Codes>
std::string joined(const Codes& codes) {
  std::string text;
  for (std::string_view code : codes) text.append(text.empty() ? "" : " ").append(code);
  return text;
}

bool isClassThatIsGone(std::string_view typeName) {
  const Class* type = Class::namedEvenIfHidden(typeName);
  return type != nullptr && type->isHidden();
}

constexpr std::string_view noSuchClass = "no such class";
constexpr std::string_view noSuchMember = "no such member";

std::string_view kindName(CheckKind kind) {
  switch (kind) {
    case CheckKind::classExists:
      return "exists";
    case CheckKind::kindOfClass:
      return "is kind of";
    case CheckKind::instanceVariable:
      return "has instance variable";
    case CheckKind::instanceMethod:
      return "has instance method";
    case CheckKind::classMethod:
      return "has class method";
    case CheckKind::protocol:
      return "conforms to protocol";
    case CheckKind::overriddenMethod:
      return "takes override of instance method";
    case CheckKind::overriddenClassMethod:
      return "takes override of class method";
  }
  return "";
}

}  // namespace

std::string ContractCheck::description() const {
  std::string text = className;
  text.append(" ").append(kindName(kind));
  return member.empty() ? text : text + " " + member;
}

Class& ValidationManager::staticClass() {
  static Class& result = ClassBuilder<ValidationManager>("ValidationManager", Object::staticClass())
                             .classMethod<&ValidationManager::sharedInstance>("sharedInstance")
                             .build();
  return result;
}

Ref<ValidationManager> ValidationManager::sharedInstance() {
  static NeverDestroyed<Ref<ValidationManager>> manager(make<ValidationManager>());
  return *manager;
}

void ValidationManager::
    performValidationsWithPreValidationHandlerPostValidationHandlerSafeCategoryInstallationHandler(
        const BoolHandler& validations, const BoolHandler& preValidation, const Handler& postValidation,
        const Handler& installation) {
  ++starts_;
  runsChecks_ = preValidation(*this);
  if (runsChecks_) validations(*this);
  if (postValidation) postValidation(*this);
  installation(*this);
}

void ValidationManager::setValidationTargetName(const Ref<String>& name) {
  targetName_ = name ? name->text() : "";
}
void ValidationManager::setOverrideProcessName(const Ref<String>& name) {
  processName_ = name ? name->text() : "";
}

bool ValidationManager::record(ContractCheck check) {
  check.category = currentCategory_;
  checks_.push_back(std::move(check));
  return checks_.back().passed;
}

bool ValidationManager::validateClass(std::string_view className) {
  const bool exists = Class::named(className) != nullptr;
  return record({CheckKind::classExists, "", std::string(className), "", "a class",
                 std::string(exists ? "a class" : noSuchClass), exists});
}

bool ValidationManager::validateClassIsKindOfClass(std::string_view className, std::string_view baseName) {
  const Class* checked = Class::named(className);
  const Class* base = Class::named(baseName);
  ContractCheck check{CheckKind::kindOfClass,
                      "",
                      std::string(className),
                      std::string(baseName),
                      "a subclass of " + std::string(baseName),
                      std::string(noSuchClass),
                      false};
  if (checked != nullptr) {
    check.passed = base != nullptr && checked->isSubclassOf(*base);
    const Class* superclass = checked->superclass();
    check.found = check.passed            ? check.expected
                  : base == nullptr       ? "no class " + std::string(baseName)
                  : superclass == nullptr ? "a root class"
                                          : "a subclass of " + superclass->name();
  }
  return record(std::move(check));
}

bool ValidationManager::validateClassHasInstanceVariableWithType(std::string_view className,
                                                                 std::string_view variable,
                                                                 std::string_view type) {
  const Class* checked = Class::named(className);
  const InstanceVariable* found =
      checked == nullptr ? nullptr : checked->instanceVariable(Selector::find(variable));
  std::string is = found != nullptr ? found->type() : std::string(checked ? noSuchMember : noSuchClass);
  if (found != nullptr && isClassThatIsGone(is)) is.insert(0, "no class ");
  const bool passed = found != nullptr && is == type;
  return record({CheckKind::instanceVariable, "", std::string(className), std::string(variable),
                 std::string(type), std::move(is), passed});
}

bool ValidationManager::checkMethod(CheckKind kind, std::string_view className, std::string_view method,
                                    FullSignature signature) {
  ContractCheck check{
      kind, "", std::string(className), withoutBlanks(method), joined(signature), std::string(noSuchClass),
      false};
  if (const Class* checked = Class::named(className)) {
    const Class& answering = kind == CheckKind::classMethod ? checked->metaclass() : *checked;
    const Method& found = answering.lookUp(Selector::intern(check.member));
    check.found = found.function == nullptr ? std::string(noSuchMember) : joined(found.signature->encodings);
    check.passed = check.found == check.expected;
  }
  return record(std::move(check));
}

bool ValidationManager::validateClassHasInstanceMethodWithFullSignature(std::string_view className,
                                                                        std::string_view method,
                                                                        FullSignature signature) {
  return checkMethod(CheckKind::instanceMethod, className, method, signature);
}

bool ValidationManager::validateClassHasClassMethodWithFullSignature(std::string_view className,
                                                                     std::string_view method,
                                                                     FullSignature signature) {
  return checkMethod(CheckKind::classMethod, className, method, signature);
}

bool ValidationManager::validateClassConformsToProtocol(std::string_view className,
                                                        std::string_view protocol) {
  const Class* checked = Class::named(className);
  const bool conforms = checked != nullptr && checked->conformsTo(protocol);
  return record({CheckKind::protocol, "", std::string(className), std::string(protocol), "adopted",
                 checked == nullptr ? std::string(noSuchClass)
                 : conforms         ? "adopted"
                                    : "not adopted",
                 conforms});
}

void ValidationManager::installSafeCategoryCanInteractWithTargetClass(std::string_view category,
                                                                      bool canInteract) {
  requests_.push_back({std::string(category), canInteract, installCategory(category)});
}

bool ValidationManager::installCategory(std::string_view name) {
  Class* category = Class::named(name);
  if (category == nullptr) return false;
  Class* target = Class::named(categoryTargetClassName(*category));
  if (target == nullptr || graftOf(*category) != nullptr) return false;
  if (runsChecks_) {
    currentCategory_ = name;
    performCategoryValidations(*category, Ref<ValidationManager>(this));
    currentCategory_.clear();
  }
  graftCategory(*category, *target);
  recordLeftToHost(*graftOf(*category));
  return true;
}

namespace {

// Where the host answers nothing beneath the categories, the method is that of the one that added it.
std::string keeperOf(const Method& answering) {
  const Method* method = &answering;
  std::string added;
  while (method->graft != nullptr) {
    added = method->graft->category->name();
    method = &superMethod(*method, method->selector);
  }
  return method->function != nullptr ? "the host" : added;
}

}  // namespace

void ValidationManager::recordLeftToHost(const CategoryGraft& graft) {
  for (const LeftToHost& left : graft.leftToHost) {
    checks_.push_back(
        {left.isClassMethod ? CheckKind::overriddenClassMethod : CheckKind::overriddenMethod,
         graft.category->name(), graft.target->name(), std::string(left.override->selector.name()),
         joined(left.override->signature->encodings),
         joined(left.hostMethod->signature->encodings) + ", left to " + keeperOf(*left.hostMethod), false});
  }
}

std::vector<ContractCheck> ValidationManager::failedChecks() const {
  std::vector<ContractCheck> failed;
  std::copy_if(checks_.begin(), checks_.end(), std::back_inserter(failed),
               [](const ContractCheck& check) { return !check.passed; });
  return failed;
}

static const RegisteredClass<ValidationManager> registered;

}  // namespace ax
