#include "reader/scene/HostNames.h"

#include <algorithm>
#include <charconv>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/runtime/ClassBuilder.h"

namespace ax::reader {

namespace {

bool isInLine(const Class& start, std::string_view name) {
  for (const Class* c = &start; c != nullptr; c = c->superclass()) {
    if (c->name() == name) return true;
  }
  return false;
}

// Whether a category for the object's class, or for one above it, brings the method.
bool categoryBrings(const Object& object, Selector selector) {
  static const Class* const categories = Class::namedEvenIfHidden("SafeCategory");
  if (categories == nullptr) return false;
  const bool isClass = object.isa().isMetaclass();
  const std::vector<Class*> all = Class::all();
  return std::any_of(all.begin(), all.end(), [&](Class* category) {
    if (category == categories || !category->isSubclassOf(*categories)) return false;
    const Class& table = isClass ? category->metaclass() : *category;
    return table.ownMethod(selector) != nullptr && isInLine(object.isa(), categoryTargetClassName(*category));
  });
}

}  // namespace

bool answersMethod(const Class& declaring, Selector selector) {
  return selector && (declaring.lookUp(selector).function != nullptr || declaring.hasHiddenMember(selector));
}

std::string setterName(const std::string& key) {
  return ClassBuilder<Object>::setterName(key);
}

bool hasSettableMember(const Class& declaring, const std::string& key) {
  const Selector variable = Selector::find(key);
  if (variable && declaring.instanceVariableEvenIfHidden(variable) != nullptr) return true;
  return answersMethod(declaring, Selector::find(setterName(key)));
}

bool mayAnswer(const Object& object, std::string_view method) {
  const Selector selector = Selector::find(method);
  return selector && (answersMethod(object.isa(), selector) || categoryBrings(object, selector));
}

std::pair<Class*, std::string> classAndMember(std::string_view given) {
  std::string name(given);
  std::erase(name, ' ');
  if (Class* whole = Class::namedEvenIfHidden(name)) return {whole, ""};
  if (name.ends_with('.')) return {nullptr, ""};  // a member is named, and has no name
  for (std::size_t dot = name.rfind('.'); dot != std::string::npos && dot != 0;
       dot = name.rfind('.', dot - 1)) {
    if (Class* found = Class::namedEvenIfHidden(name.substr(0, dot))) return {found, name.substr(dot + 1)};
  }
  return {nullptr, ""};
}

std::pair<std::string, std::vector<std::size_t>> splitTarget(std::string_view text) {
  std::vector<std::size_t> indexes;
  for (std::size_t dot = text.rfind('.'); dot != std::string_view::npos; dot = text.rfind('.')) {
    const std::string_view last = text.substr(dot + 1);
    std::size_t index = 0;
    const auto [end, error] = std::from_chars(last.data(), last.data() + last.size(), index);
    if (error != std::errc() || end != last.data() + last.size()) break;
    indexes.insert(indexes.begin(), index);
    text = text.substr(0, dot);
  }
  return {std::string(text), indexes};
}

}  // namespace ax::reader
