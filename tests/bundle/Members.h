#pragma once

#include <gtest/gtest.h>

#include <string_view>

#include "platform/runtime/Boxing.h"
#include "platform/runtime/Class.h"
#include "platform/runtime/KeyReading.h"

// Members of host objects by their names, where the C++ class keeps them to itself.
namespace ax {

inline void setMember(Object& object, std::string_view name, const Ref<Object>& value) {
  const InstanceVariable* variable = object.isa().instanceVariable(Selector::intern(name));
  ASSERT_NE(variable, nullptr) << name;
  ASSERT_TRUE(variable->write(object, value)) << name;
}

template <class T>
Ref<T> member(Object& object, std::string_view name) {
  return cast<T>(object.safeValueForKey(Selector::intern(name)));
}

}  // namespace ax
