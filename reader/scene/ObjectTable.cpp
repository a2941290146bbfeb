#include "reader/scene/ObjectTable.h"

#include "platform/foundation/Array.h"
#include "reader/scene/HostNames.h"

namespace ax::reader {

void ObjectTable::addId(const std::string& id, const Ref<Object>& object) {
  byName_[id] = object;
  ids_[object.get()] = id;
}

Ref<Object> ObjectTable::withId(const std::string& id) const {
  const auto found = byName_.find(id);
  return found != byName_.end() && found->second && idOf(*found->second) == id ? found->second : nullptr;
}

const std::string& ObjectTable::idOf(const Object& object) const {
  static const std::string none;
  const auto found = ids_.find(&object);
  return found == ids_.end() ? none : found->second;
}

Ref<Object> ObjectTable::item(const Ref<Object>& list, std::size_t index, const std::string& target,
                              const std::string& place) const {
  if (!list) return nullptr;
  const Array* items = cast<Array>(list.get());
  if (items == nullptr) throw Fault{file_, place, "no list for \"" + target + "\"", "the name of a list"};
  if (index < items->count()) return items->at(index);
  throw Fault{file_, place, "no item \"" + target + "\" in a list of " + std::to_string(items->count()),
              "a smaller index, counted from 0"};
}

Ref<Object> ObjectTable::find(const std::string& target, const std::string& place) const {
  const auto [name, indexes] = splitTarget(target);
  const auto found = byName_.find(name);
  Ref<Object> result = found != byName_.end() ? found->second : Ref<Object>(Class::namedEvenIfHidden(name));
  for (std::size_t index : indexes) result = item(result, index, target, place);
  return result;
}

}  // namespace ax::reader
