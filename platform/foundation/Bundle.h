#pragma once

#include <map>
#include <memory>

#include "platform/foundation/String.h"

namespace ax {

namespace formatting {
class StringTable;
}

// A module's resources, found beside the module wherever it is installed. Main thread only.
class Bundle final : public Object {
 public:
  static Class& staticClass();

  explicit Bundle(std::string resourceFolder);
  ~Bundle() override;

  // The bundle whose module holds a class: the module must have said so with setBundleOfClass. Nil for a
  // class that nobody bundled.
  static Ref<Bundle> bundleForClass(const Class* owner);

  // The text of a key in the environment's language, the same object at every call; `fallback` for a key or
  // a table that is not there.
  Ref<String> localizedStringForKey(std::string_view key, const Ref<String>& fallback,
                                    std::string_view table);

 private:
  struct Table;
  std::string folder_;
  std::map<std::string, std::unique_ptr<Table>, std::less<>> tables_;
};

// Names the folder that holds a class's resources: `relative` from the folder of the module in which
// `addressInModule` lies.
void setBundleOfClass(Class& owner, const void* addressInModule, std::string_view relative);

// The platform's own words.
Ref<String> platformString(std::string_view key);

}  // namespace ax
