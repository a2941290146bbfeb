#include "platform/runtime/Class.h"

#include <algorithm>
#include <functional>
#include <map>
#include <mutex>

#include "platform/runtime/ClassBuilder.h"
#include "platform/runtime/Precondition.h"

namespace ax {

namespace {

// Guards every change of the registry and of the classes' tables; finding goes without it.
std::recursive_mutex& runtimeMutex() {
  static auto* const mutex = new std::recursive_mutex;
  return *mutex;
}

using ClassesByName = std::map<std::string, Class*, std::less<>>;

ClassesByName& classesByName() {
  static auto* const classes = new ClassesByName;
  return *classes;
}

}  // namespace

Class& Class::staticClass() {
  static Class& result = Class::add("Class", &Object::staticClass(), nullptr);
  return result;
}

Class::Class(std::string name, Class* superclass, Ref<Object> (*factory)())
    : name_(std::move(name)), superclass_(superclass), factory_(factory) {
  if (superclass_ != nullptr) {
    lineage_ = superclass_->lineage_;
    depth_ = superclass_->depth_ + 1;
    superclass_->subclasses_.push_back(this);
  }
  lineage_.push_back(this);
}

Class& Class::add(std::string name, Class* superclass, Ref<Object> (*factory)()) {
  const std::lock_guard lock(runtimeMutex());
  precondition(!classesByName().contains(name), "a class of this name is registered: choose another name");
  auto* added = new Class(name, superclass, factory);
  auto* meta = new Class(name, superclass == nullptr ? added : superclass->metaclass_, nullptr);
  meta->isMetaclass_ = true;
  added->metaclass_ = meta;
  added->isa_ = meta;
  meta->isa_ = meta;
  Selector::intern(name).record()->namedClass.store(added, std::memory_order_release);
  classesByName().emplace(std::move(name), added);
  return *added;
}

Class* Class::namedEvenIfHidden(std::string_view name) {
  const std::lock_guard lock(runtimeMutex());
  const auto found = classesByName().find(name);
  return found == classesByName().end() ? nullptr : found->second;
}

std::vector<Class*> Class::all() {
  const std::lock_guard lock(runtimeMutex());
  std::vector<Class*> result;
  for (const auto& [name, entry] : classesByName()) result.push_back(entry);
  return result;
}

const Method& Class::lookUpSlowly(Selector selector) const {
  static constexpr Method ofNoName = {};
  if (!selector) return ofNoName;
  const Method* known = methodCache_.find(selector);
  return known != nullptr ? *known : findMethod(selector);
}

const Method& Class::findMethod(Selector selector) const {
  const std::lock_guard lock(runtimeMutex());
  const Method* result = selector.record()->missing;
  for (const Class* c = this; c != nullptr; c = c->superclass_) {
    if (const Method* own = c->methods_.find(selector)) {
      result = own;
      break;
    }
  }
  methodCache_.insert(result);
  cachedMethods_.remember(*result);
  return *result;
}

const InstanceVariable* Class::instanceVariable(Selector selector) const {
  for (const Class* c = this; c != nullptr; c = c->superclass_) {
    if (const InstanceVariable* own = c->variables_.find(selector)) return own;
  }
  return nullptr;
}

const InstanceVariable* Class::instanceVariableEvenIfHidden(Selector selector) const {
  for (const Class* c = this; c != nullptr; c = c->superclass_) {
    if (const InstanceVariable* own = c->variables_.find(selector)) return own;
    if (const InstanceVariable* own = c->hiddenVariables_.find(selector)) return own;
  }
  return nullptr;
}

const KeyReader& Class::readerForKeySlowly(Key key) const {
  static constexpr KeyReader ofNoName = {};
  if (!key) return ofNoName;
  const KeyReader* known = keyCache_.find(key);
  return known != nullptr ? *known : findReader(key);
}

const KeyReader& Class::findReader(Key key) const {
  const std::lock_guard lock(runtimeMutex());
  KeyReader& reader = ownedReaders_.emplace_back();
  reader.selector = key;
  reader.variable = instanceVariable(key);
  if (reader.variable != nullptr) {
    reader.objectOffset = reader.variable->objectOffset;
  } else {
    const Method& method = lookUp(key);
    const bool isReadable = method.function != nullptr && method.signature->encodings.size() == 1 &&
                            method.signature->encodings[0] != "v";
    if (isReadable) reader.method = &method;
  }
  keyCache_.insert(&reader);
  cachedReaders_.remember(reader);
  return reader;
}

bool Class::conformsTo(std::string_view protocol) const {
  return std::any_of(lineage_.begin(), lineage_.end(), [&](const Class* c) {
    return std::find(c->protocols_.begin(), c->protocols_.end(), protocol) != c->protocols_.end();
  });
}

void Class::forEachOwnMethod(const std::function<void(const Method&)>& visit) const {
  methods_.forEach(visit);
}

void Class::forEachOwnInstanceVariable(const std::function<void(const InstanceVariable&)>& visit) const {
  variables_.forEach(visit);
}

const Method& Class::addMethod(Method method) {
  const Method* const added = &keepMethod(method);
  publishMethods({&added, 1});
  return *added;
}

const Method& Class::keepMethod(Method method) {
  const std::lock_guard lock(runtimeMutex());
  method.owner = this;
  return ownedMethods_.emplace_back(method);
}

void Class::publishMethods(std::span<const Method* const> kept) {
  const std::lock_guard lock(runtimeMutex());
  for (const Method* method : kept) {
    precondition(method->owner == this, "an entry is published by the class that keeps it");
    methods_.insert(method);
  }
  forgetCaches();
}

void Class::addInstanceVariable(InstanceVariable variable) {
  const std::lock_guard lock(runtimeMutex());
  precondition(variables_.find(variable.selector) == nullptr,
               "the class has an instance variable of this name: register it once");
  variables_.insert(&ownedVariables_.emplace_back(variable));
  forgetCaches();
}

void Class::forgetCaches() {
  if (methodCache_.size() != 0) {
    methodCache_.clear();
    cachedMethods_.clear();
  }
  if (keyCache_.size() != 0) {
    keyCache_.clear();
    cachedReaders_.clear();
  }
  for (Class* subclass : subclasses_) subclass->forgetCaches();
}

void Class::hide() {
  const std::lock_guard lock(runtimeMutex());
  isHidden_ = true;
  Selector::intern(name_).record()->namedClass.store(nullptr, std::memory_order_release);
}

bool Class::hideMember(std::string_view name) {
  const std::lock_guard lock(runtimeMutex());
  const Selector selector = Selector::intern(name);
  bool hidden = false;
  if (const InstanceVariable* variable = variables_.find(selector)) {
    hiddenVariables_.insert(variable);
    variables_.erase(selector);
    hidden = true;
  }
  for (Class* c : {this, metaclass_}) {
    if (c == nullptr) continue;
    if (const Method* method = c->methods_.find(selector)) {
      c->hiddenMethods_.insert(method);
      c->methods_.erase(selector);
      c->forgetCaches();
      hidden = true;
    }
  }
  const auto protocol = std::find(protocols_.begin(), protocols_.end(), name);
  if (protocol != protocols_.end()) {
    protocols_.erase(protocol);
    hidden = true;
  }
  forgetCaches();
  return hidden;
}

bool Class::hasHiddenMember(Selector selector) const {
  return std::any_of(lineage_.begin(), lineage_.end(), [&](const Class* c) {
    return c->hiddenMethods_.find(selector) != nullptr || c->hiddenVariables_.find(selector) != nullptr;
  });
}

static const RegisteredClass<Class> registered;

}  // namespace ax
