#pragma once

#include <atomic>
#include <deque>
#include <functional>
#include <span>
#include <string>
#include <vector>

#include "platform/runtime/LookUpCache.h"
#include "platform/runtime/Method.h"
#include "platform/runtime/Object.h"
#include "platform/runtime/SelectorTable.h"

namespace ax {

struct CategoryRecord;

// A member that is reached by name: plain functions that read and write it, and name its declared type (a
// class name, or the type code of a scalar). The type is asked for late, so that classes may hold one
// another.
struct InstanceVariable {
  Selector selector = {};
  std::ptrdiff_t objectOffset = -1;  // where it lies, if it is nothing but the address of an object
  std::string (*type)() = nullptr;
  Ref<Object> (*read)(const Object&) = nullptr;
  bool (*write)(Object&, const Ref<Object>&) = nullptr;  // false: the value is of another kind
};

// How a class answers one key: an instance variable, a method without arguments, or neither.
struct KeyReader {
  Selector selector = {};
  std::ptrdiff_t objectOffset = -1;
  const InstanceVariable* variable = nullptr;
  const Method* method = nullptr;

  bool isReadable() const { return variable != nullptr || method != nullptr; }
};

// A class of the process, known by its name. Class objects live as long as the process. A class is itself an
// object: its class is its metaclass, which holds the class methods, so that messages and keys go to classes
// as they go to instances.
//
// Classes are registered, grafted and hidden on one thread at a time; they may be looked up, and messages
// sent, from any thread.
class Class final : public Object {
 public:
  static Class& staticClass();

  // The class registered under a name, or nil; hidden classes are not found by name. A name that is written
  // in the code is handed over as its selector, which is found once: named("MonthWeekView"_key).
  static Class* named(Selector name) {
    return name ? name.record()->namedClass.load(std::memory_order_acquire) : nullptr;
  }
  static Class* named(std::string_view name) { return named(Selector::find(name)); }
  static Class* namedEvenIfHidden(std::string_view name);
  static std::vector<Class*> all();

  // Registers a class; the name must be new. `factory` makes an instance, or is null for abstract classes.
  static Class& add(std::string name, Class* superclass, Ref<Object> (*factory)());

  const std::string& name() const { return name_; }
  Class* superclass() const { return superclass_; }
  bool isSubclassOf(const Class& other) const {
    return other.depth_ < lineage_.size() && lineage_[other.depth_] == &other;
  }
  bool isMetaclass() const { return isMetaclass_; }
  Class& metaclass() { return *metaclass_; }
  const Class& metaclass() const { return *metaclass_; }
  bool isHidden() const { return isHidden_; }
  Ref<Object> instantiate() const { return factory_ == nullptr ? nullptr : factory_(); }

  // The entry that answers a message; one without a function when the class lacks it. Never fails.
  const Method& lookUp(Selector selector) const {
    const Method& method = firstAnswer(placeOf(selector));
    if (method.selector == selector) [[likely]]
      return method;
    return lookUpSlowly(selector);
  }
  // For a sender that keeps the selector's place: its entry, or that of another selector, which is never nil.
  const Method& firstAnswer(std::size_t place) const { return cachedMethods_.at(place); }
  static std::size_t placeOf(Selector selector) { return CachedMethods::placeOf(selector); }
  // Whether it is known that this entry answers its message: false also before the first look-up.
  bool isKnownToAnswerWith(const Method& method) const {
    return &cachedMethods_.find(method.selector) == &method;
  }
  // What the superclass answers at this moment.
  const Method& lookUpInSuperclass(Selector selector) const {
    return superclass_ == nullptr ? *selector.record()->missing : superclass_->lookUp(selector);
  }
  const Method* ownMethod(Selector selector) const { return methods_.find(selector); }
  // Inherited ones included.
  const InstanceVariable* instanceVariable(Selector selector) const;
  const InstanceVariable* instanceVariableEvenIfHidden(Selector selector) const;
  const KeyReader& readerForKey(Key key) const {
    const KeyReader& reader = cachedReaders_.find(key);
    return reader.selector == key ? reader : readerForKeySlowly(key);
  }
  bool conformsTo(std::string_view protocol) const;
  void forEachOwnMethod(const std::function<void(const Method&)>& visit) const;
  void forEachOwnInstanceVariable(const std::function<void(const InstanceVariable&)>& visit) const;

  // Puts an entry into the method table, in place of a former one with its selector. The caller's `owner` is
  // overwritten. Returns the entry as it stands.
  const Method& addMethod(Method method);
  // The same in two steps, for entries that refer to one another: kept entries answer nothing until they are
  // published, all of them before any is found.
  const Method& keepMethod(Method method);
  void publishMethods(std::span<const Method* const> kept);
  // The name must be new to the class.
  void addInstanceVariable(InstanceVariable variable);
  void addProtocol(std::string name) { protocols_.push_back(std::move(name)); }
  // Takes a class or a member out of everything that works by name, as if the host had renamed it. Objects
  // that exist, or are made later, keep working. False when there is no such member.
  void hide();
  bool hideMember(std::string_view name);
  bool hasHiddenMember(Selector selector) const;  // here or in a class above

  // What this class is made of as a category; null when it is none.
  const CategoryRecord* categoryRecord() const { return categoryRecord_; }
  void setCategoryRecord(const CategoryRecord& record) { categoryRecord_ = &record; }
  // What this class, as a category, brought to its target; null until all of it answers.
  const CategoryGraft* graft() const { return graft_.load(std::memory_order_acquire); }
  void setGraft(const CategoryGraft& graft) { graft_.store(&graft, std::memory_order_release); }

  std::string description() const override { return name_; }

 private:
  using CachedMethods = LookUpCache<Method, 32>;

  Class(std::string name, Class* superclass, Ref<Object> (*factory)());
  const Method& lookUpSlowly(Selector selector) const;
  const Method& findMethod(Selector selector) const;
  const KeyReader& readerForKeySlowly(Key key) const;
  const KeyReader& findReader(Key key) const;
  void forgetCaches();

  std::string name_;
  Class* superclass_;
  Class* metaclass_ = nullptr;
  std::size_t depth_ = 0;
  std::vector<const Class*> lineage_;  // from the root to this class
  std::vector<Class*> subclasses_;
  Ref<Object> (*factory_)();
  bool isMetaclass_ = false;
  bool isHidden_ = false;
  SelectorTable<Method> methods_;
  SelectorTable<InstanceVariable> variables_;
  SelectorTable<InstanceVariable> hiddenVariables_;
  SelectorTable<Method> hiddenMethods_;
  std::vector<std::string> protocols_;
  mutable CachedMethods cachedMethods_;
  mutable LookUpCache<KeyReader, 32> cachedReaders_;
  mutable SelectorTable<Method> methodCache_;
  mutable SelectorTable<KeyReader> keyCache_;
  const CategoryRecord* categoryRecord_ = nullptr;
  std::atomic<const CategoryGraft*> graft_ = nullptr;
  std::deque<Method> ownedMethods_;
  std::deque<InstanceVariable> ownedVariables_;
  mutable std::deque<KeyReader> ownedReaders_;
};

// A class as an object is known by its metaclass, which derives from no class of this name.
template <>
inline Class* cast<Class>(Object* object) {
  return object != nullptr && object->isa().isMetaclass() ? static_cast<Class*>(object) : nullptr;
}

// The class registered under a name, or nil. A literal finds its name once: safeClassFromString("View"_key).
inline Class* safeClassFromString(Selector name) {
  return Class::named(name);
}
inline Class* safeClassFromString(std::string_view name) {
  return Class::named(name);
}

}  // namespace ax
