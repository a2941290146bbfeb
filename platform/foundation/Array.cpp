#include "platform/foundation/Array.h"

#include <algorithm>

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/KeyReading.h"

namespace ax {

Class& Array::staticClass() {
  static Class& result =
      ClassBuilder<Array>("Array", Object::staticClass()).method<&Array::firstObject>("firstObject").build();
  return result;
}

Class& MutableArray::staticClass() {
  static Class& result = ClassBuilder<MutableArray>("MutableArray", Array::staticClass()).build();
  return result;
}

bool Array::isEqual(const Object& other) const {
  const Array* list = cast<Array>(&other);
  return list != nullptr && std::equal(begin(), end(), list->begin(), list->end(),
                                       [](const auto& a, const auto& b) { return a->isEqual(*b); });
}

std::string Array::description() const {
  std::string text = "(";
  for (const Ref<Object>& item : items_) text += (text.size() > 1 ? ", " : "") + item->description();
  return text + ")";
}

Ref<Object> MutableArray::copy() {
  return array(items_);
}

Ref<Array> axArrayByIgnoringNilElementsWithCount(std::size_t count,
                                                 std::initializer_list<Ref<Object>> elements) {
  Array::Items kept;
  for (const Ref<Object>& element : std::span(elements.begin(), std::min(count, elements.size()))) {
    if (element) kept.push_back(element);
  }
  return array(std::move(kept));
}

Ref<Array> safeArrayForKey(Receiver receiver, Key key) {
  return cast<Array>(safeValueForKey(receiver, key));
}

static const RegisteredClass<Array> registered;
static const RegisteredClass<MutableArray> registeredMutable;

}  // namespace ax
