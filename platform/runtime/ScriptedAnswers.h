#pragma once

#include <functional>
#include <span>

#include "platform/runtime/Class.h"

namespace ax {

// A reply computed from the boxed arguments; it may raise.
using ScriptedAnswer = std::function<Ref<Object>(std::span<const Ref<Object>>)>;

// Gives one object a reply of its own for a method that its class, or a class above it, declares; overrides
// that were grafted onto the method stay in front of it and reach the reply as super. False when no class in
// its line declares the method.
bool setScriptedAnswer(Object& object, Selector selector, ScriptedAnswer answer);

// Stands in front of a method for every receiver: the first says whether it answers instead, by the second;
// it may raise. Method and answer are for the whole process, and no other thread may send meanwhile.
using MethodAnswer = std::function<std::pair<bool, Ref<Object>>(Object&, std::span<const Ref<Object>>)>;
void setMethodAnswer(const Method& declared, MethodAnswer answer);

// The object answers by itself again, and what its replies held is let go.
void removeScriptedAnswers(Object& object);

}  // namespace ax
