#include "platform/runtime/KeyReading.h"

#include <atomic>
#include <cstdio>
#include <cstring>
#include <mutex>
#include <set>

#include "platform/runtime/Boxing.h"

namespace ax {

namespace {

// The member of a path's piece: the one of the very name, else the one with an underscore before it.
Key keyInPath(const Object& object, std::string_view name) {
  const Key exact = Selector::find(name);
  if (name.empty() || (exact && object.isa().readerForKey(exact).isReadable())) return exact;
  return Selector::find(std::string("_").append(name));
}

Ref<Object> readGuarded(const Object& object, const KeyReader& reader) {
  try {
    if (reader.variable != nullptr) return reader.variable->read(object);
    if (reader.method == nullptr) return nullptr;
    return reader.method->signature->invoke(const_cast<Object&>(object), *reader.method, {});
  } catch (...) {
    return nullptr;
  }
}

}  // namespace

Ref<Object> Object::safeValueForKey(Key key) const {
  if (!key) return nullptr;
  const KeyReader& reader = isa().readerForKey(key);
  if (reader.objectOffset < 0) return readGuarded(*this, reader);
  Object* value;
  std::memcpy(&value, reinterpret_cast<const char*>(this) + reader.objectOffset, sizeof(std::uintptr_t));
  return Ref<Object>(value);
}

Ref<Object> Object::safeValueForKeyPath(std::string_view dottedKeys) const {
  Ref<Object> value(const_cast<Object*>(this));
  while (value) {
    const std::size_t dot = dottedKeys.find('.');
    value = value->safeValueForKey(keyInPath(*value, dottedKeys.substr(0, dot)));
    if (dot == std::string_view::npos) break;
    dottedKeys.remove_prefix(dot + 1);
  }
  return value;
}

bool Object::safeBoolForKey(Key key) const {
  return unboxBool(safeValueForKey(key));
}
std::int64_t Object::safeIntForKey(Key key) const {
  return unboxInt(safeValueForKey(key));
}
// A method that answers a double is asked for it without a number in between.
namespace {

// Apart, so that the common read saves no registers for it.
[[gnu::noinline]] double unboxedDoubleForKey(const Object& object, Key key) {
  return unboxDouble(object.safeValueForKey(key));
}

}  // namespace

double Object::safeDoubleForKey(Key key) const {
  const Method* method = key ? isa().readerForKey(key).method : nullptr;
  if (method == nullptr || method->signature != &signatureOf<double>())
    return unboxedDoubleForKey(*this, key);
  try {
    return reinterpret_cast<double (*)(Object&, const Method&)>(method->function)(const_cast<Object&>(*this),
                                                                                  *method);
  } catch (...) {
    return 0;
  }
}

Ref<Object> safeValueForKey(Receiver receiver, Key key) {
  return receiver.get() == nullptr ? nullptr : receiver.get()->safeValueForKey(key);
}
bool safeBoolForKey(Receiver receiver, Key key) {
  return unboxBool(safeValueForKey(receiver, key));
}
std::int64_t safeIntForKey(Receiver receiver, Key key) {
  return unboxInt(safeValueForKey(receiver, key));
}
double safeDoubleForKey(Receiver receiver, Key key) {
  return receiver.get() == nullptr ? 0 : receiver.get()->safeDoubleForKey(key);
}

namespace {
std::atomic<std::size_t> mismatches = 0;
}

void reportCastMismatch(const Object& object, std::string_view expected, SourcePlace place) {
  ++mismatches;
#ifndef NDEBUG
  static std::mutex mutex;
  static std::set<std::pair<std::string_view, unsigned>> reported;
  const std::lock_guard lock(mutex);
  if (!reported.emplace(place.file, place.line).second) return;
  std::string_view file = place.file;
  file.remove_prefix(file.find_last_of('/') + 1);
  std::fprintf(stderr, "AX Velto: %.*s:%u: expected an object of class %.*s, found %s\n", int(file.size()),
               file.data(), place.line, int(expected.size()), expected.data(), object.isa().name().c_str());
#else
  (void)object, (void)expected, (void)place;
#endif
}

std::size_t castMismatches() {
  return mismatches;
}

Ref<Object> safeClass(Selector className, Ref<Object> object, bool* mismatch, SourcePlace place) {
  const bool isMismatch = object && !object->isKindOf(Class::named(className));
  if (mismatch != nullptr) *mismatch = isMismatch;
  if (!isMismatch) return object;
  reportCastMismatch(*object, className.name(), place);
  return nullptr;
}

}  // namespace ax
