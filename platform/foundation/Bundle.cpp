#include "platform/foundation/Bundle.h"

#include <unordered_map>

#include "platform/formatting/StringTable.h"
#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/MainThread.h"
#include "platform/runtime/Precondition.h"

namespace ax {

namespace {
const char bundleKey = 0;
}

struct Bundle::Table {
  explicit Table(std::string folder) : texts(std::move(folder)) {}
  formatting::StringTable texts;
  std::unordered_map<const std::string*, Ref<String>> shared;  // one String per text of the table
};

Class& Bundle::staticClass() {
  static Class& result = ClassBuilder<Bundle>("Bundle", Object::staticClass()).build();
  return result;
}

Bundle::Bundle(std::string resourceFolder) : folder_(std::move(resourceFolder)) {}
Bundle::~Bundle() = default;

Ref<Bundle> Bundle::bundleForClass(const Class* owner) {
  return owner == nullptr ? nullptr : cast<Bundle>(owner->attachedValue(&bundleKey));
}

Ref<String> Bundle::localizedStringForKey(std::string_view key, const Ref<String>& fallback,
                                          std::string_view table) {
  precondition(isMainThread(), "localized texts are shared objects of the main thread: ask for them there");
  auto found = tables_.find(table);
  if (found == tables_.end()) {
    const std::string name(table);
    found = tables_.emplace(name, std::make_unique<Table>(folder_ + "/" + name)).first;
  }
  const std::string* text = found->second->texts.find(key);
  if (text == nullptr) return fallback;
  Ref<String>& shared = found->second->shared[text];
  if (!shared) shared = string(*text);
  return shared;
}

void setBundleOfClass(Class& owner, const void* addressInModule, std::string_view relative) {
  owner.attach(&bundleKey, make<Bundle>(formatting::resourceFolderBeside(addressInModule, relative)));
}

Ref<String> platformString(std::string_view key) {
  static const char inThisModule = 0;
  static const Ref<Bundle>& bundle =
      *new Ref<Bundle>(make<Bundle>(formatting::resourceFolderBeside(&inThisModule, "../share/axvelto")));
  return bundle->localizedStringForKey(key, nullptr, "Platform");
}

static const RegisteredClass<Bundle> registered;

}  // namespace ax
