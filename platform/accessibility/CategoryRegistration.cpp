#include "platform/accessibility/CategoryRegistration.h"

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

const Message<Ref<String>()> safeCategoryTargetClassName{"safeCategoryTargetClassName"};
const Message<Ref<Object>()> safeCategoryBaseClassMessage{"safeCategoryBaseClass"};
const Message<void(Ref<ValidationManager>)> performValidations{"_accessibilityPerformValidations:"};

const char targetNameKey = 0;
const char validationsKey = 0;

// A category's validations, kept on its class object.
class Validations final : public Object {
 public:
  static Class& staticClass() {
    static Class& result = Class::add("CategoryValidations", &Object::staticClass(), nullptr);
    return result;
  }
  explicit Validations(void (*function)(ValidationManager&)) : perform(function) {}
  void (*perform)(ValidationManager&);
};

Class& safeCategoryClass() {
  static Class& result = Class::add("SafeCategory", &Object::staticClass(), nullptr);
  return result;
}

Ref<Object> targetNameOf(Object& category, const Method&) {
  return category.attachedValue(&targetNameKey);
}
Ref<Object> baseClassOf(Object&, const Method&) {
  return Ref<Object>(&safeCategoryClass());
}
void validate(Object& category, const Method&, Ref<Object> manager) {
  const auto* validations = static_cast<const Validations*>(category.attached(&validationsKey));
  ValidationManager* to = cast<ValidationManager>(manager.get());
  if (validations != nullptr && to != nullptr) validations->perform(*to);
}

}  // namespace

Class& registerCategory(std::string_view name, std::string_view targetClassName,
                        void (*validations)(ValidationManager&), std::span<const Override> overrides) {
  const std::string categoryName(name);
  Class& hinge = Class::add("__" + categoryName + "_super", &safeCategoryClass(), nullptr);
  Class& category = Class::add(categoryName, &hinge, nullptr);
  category.attach(&targetNameKey, string(std::string(targetClassName)));
  category.attach(&validationsKey, make<Validations>(validations));
  using registration::record;
  Class& meta = category.metaclass();
  meta.addMethod(record<Ref<Object>>(safeCategoryTargetClassName.selector(), &targetNameOf));
  meta.addMethod(record<Ref<Object>>(safeCategoryBaseClassMessage.selector(), &baseClassOf));
  meta.addMethod(record<void, Ref<Object>>(performValidations.selector(), &validate));
  for (const Override& override : overrides) {
    (override.isClassMethod ? meta : category).addMethod(override.method);
  }
  return category;
}

const Method* safeCategoryEntry(const Class* category, Receiver object, bool* mismatch, SourcePlace place) {
  const CategoryGraft* graft = category == nullptr ? nullptr : graftOf(*category);
  const bool isOfTarget =
      graft != nullptr && object.get() != nullptr && object.get()->isKindOf(*graft->target);
  const bool isMismatch = object.get() != nullptr && !isOfTarget;
  if (mismatch != nullptr) *mismatch = isMismatch;
  if (isMismatch) {
    reportCastMismatch(*object.get(), category == nullptr ? "unregistered category" : category->name(),
                       place);
  }
  return isOfTarget ? &graft->entry : nullptr;
}

std::string categoryTargetClassName(Class& category) {
  const Ref<String> name = safeCategoryTargetClassName(category);
  return name ? name->text() : "";
}

void performCategoryValidations(Class& category, Ref<ValidationManager> manager) {
  performValidations(category, std::move(manager));
}

}  // namespace ax
