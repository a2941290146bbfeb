#pragma once

#include "platform/runtime/Class.h"
#include "platform/runtime/Message.h"
#include "platform/runtime/SourcePlace.h"

// The guarded reads. A key names an instance variable or a method without arguments, exactly; scalars come
// boxed. What is missing, unreadable, or raises while it is read, is nil, NO or 0: a read never fails, and
// never says so.
namespace ax {

class Array;
class String;
class View;

// The same for receivers that may be nil.
Ref<Object> safeValueForKey(Receiver receiver, Key key);
bool safeBoolForKey(Receiver receiver, Key key);
std::int64_t safeIntForKey(Receiver receiver, Key key);
double safeDoubleForKey(Receiver receiver, Key key);
// Nil also when the member is of another kind.
Ref<Array> safeArrayForKey(Receiver receiver, Key key);
Ref<String> safeStringForKey(Receiver receiver, Key key);
Ref<View> safeUIViewForKey(Receiver receiver, Key key);

// Casts whose mismatch means that the host broke its contract: nil, reported through the flag, and in debug
// builds once per place to standard error.
void reportCastMismatch(const Object& object, std::string_view expected, SourcePlace place);
std::size_t castMismatches();  // in this process so far

// The class is one of a name that is written in the code: safeClass("VLUIChartView"_key, object).
Ref<Object> safeClass(Selector className, Ref<Object> object, bool* mismatch = nullptr,
                      SourcePlace place = SourcePlace::current());

template <class T, class U>
Ref<T> castAsClass(const Ref<U>& object, bool* mismatch = nullptr,
                   SourcePlace place = SourcePlace::current()) {
  Ref<T> result = cast<T>(Ref<Object>(object));
  const bool isMismatch = object && !result;
  if (isMismatch) reportCastMismatch(*object, T::staticClass().name(), place);
  if (mismatch != nullptr) *mismatch = isMismatch;
  return result;
}

template <class T>
Ref<T> castAsClass(Object& object, bool* mismatch = nullptr, SourcePlace place = SourcePlace::current()) {
  return castAsClass<T>(Ref<Object>(&object), mismatch, place);
}

// Runs a block and swallows whatever it raises; what it stored before stays stored.
template <class Block>
void performSafeBlock(Block&& block) {
  try {
    std::forward<Block>(block)();
  } catch (...) {
    return;
  }
}

}  // namespace ax
