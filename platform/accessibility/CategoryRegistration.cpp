#include "platform/accessibility/CategoryRegistration.h"

#include "platform/foundation/String.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

constinit const Message<Ref<String>()> safeCategoryTargetClassName{"safeCategoryTargetClassName"};
constinit const Message<Ref<String>()> safeCategoryScreen{"safeCategoryScreen"};
constinit const Message<Ref<Object>()> safeCategoryBaseClass{"safeCategoryBaseClass"};
constinit const Message<void(Ref<ValidationManager>)> performValidations{"_accessibilityPerformValidations:"};

// The receiver is one of the classes below "SafeCategory"; that class itself has no record.
const CategoryRecord* recordOf(Object& category) {
  return static_cast<Class&>(category).categoryRecord();
}

Ref<Object> targetNameOf(Object& category, const Method&) {
  const CategoryRecord* record = recordOf(category);
  return record == nullptr ? nullptr : string(std::string(record->targetClassName));
}
Ref<Object> screenOf(Object& category, const Method&) {
  const CategoryRecord* record = recordOf(category);
  return record == nullptr ? nullptr : string(std::string(record->screen));
}
Ref<Object> baseClassOf(Object&, const Method&) {
  return Ref<Object>(Class::named("SafeCategory"_key));
}
void validate(Object& category, const Method&, Ref<Object> manager) {
  const CategoryRecord* record = recordOf(category);
  ValidationManager* to = cast<ValidationManager>(manager.get());
  if (record == nullptr || record->validations == nullptr || to == nullptr) return;
  record->validations(Contract(*to, record->targetClassName));
}

// What every category class answers stands at their base, and is not grafted with what is their own.
Class& makeSafeCategoryClass() {
  using registration::record;
  Class& base = Class::add("SafeCategory", &Object::staticClass(), nullptr);
  Class& meta = base.metaclass();
  meta.addMethod(record<Ref<Object>>(safeCategoryTargetClassName.selector(), &targetNameOf));
  meta.addMethod(record<Ref<Object>>(safeCategoryScreen.selector(), &screenOf));
  meta.addMethod(record<Ref<Object>>(safeCategoryBaseClass.selector(), &baseClassOf));
  meta.addMethod(record<void, Ref<Object>>(performValidations.selector(), &validate));
  return base;
}

Class& safeCategoryClass() {
  static Class& result = makeSafeCategoryClass();
  return result;
}

Method entryOf(const Override& override) {
  return {.selector = override.message->selector(),
          .signature = &override.message->signature(),
          .function = override.function(),
          .result = override.result(),
          .takes = override.takes};
}

}  // namespace

Class& registerCategory(const CategoryRecord& record) {
  const std::string name(record.name);
  Class& hinge = Class::add("__" + name + "_super", &safeCategoryClass(), nullptr);
  Class& category = Class::add(name, &hinge, nullptr);
  category.setCategoryRecord(record);
  for (const Override& override : record.overrides) {
    (override.isClassMethod ? category.metaclass() : category).addMethod(entryOf(override));
  }
  return category;
}

const Method* safeCategoryEntry(Selector category, Receiver object, bool* mismatch, SourcePlace place) {
  const Class* found = Class::named(category);
  const CategoryGraft* graft = found == nullptr ? nullptr : graftOf(*found);
  const bool isOfTarget =
      graft != nullptr && object.get() != nullptr && object.get()->isKindOf(*graft->target);
  const bool isMismatch = object.get() != nullptr && !isOfTarget;
  if (mismatch != nullptr) *mismatch = isMismatch;
  if (isMismatch) reportCastMismatch(*object.get(), category.name(), place);
  return isOfTarget ? &graft->entry : nullptr;
}

std::string categoryTargetClassName(Class& category) {
  const Ref<String> name = safeCategoryTargetClassName(category);
  return name ? name->text() : "";
}

std::string categoryScreen(Class& category) {
  const Ref<String> screen = safeCategoryScreen(category);
  return screen ? screen->text() : "";
}

void performCategoryValidations(Class& category, Ref<ValidationManager> manager) {
  performValidations(category, std::move(manager));
}

}  // namespace ax
