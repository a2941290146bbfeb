#include "platform/runtime/ScriptedAnswers.h"

#include <map>

#include "platform/runtime/ClassBuilder.h"

namespace ax {

namespace {

const char answersKey = 0;

struct SelectorOrder {
  bool operator()(Selector a, Selector b) const { return a.record() < b.record(); }
};

class Answers final : public Object {
 public:
  static Class& staticClass() {
    static Class& result = Class::add("ScriptedAnswers", &Object::staticClass(), nullptr);
    return result;
  }
  std::map<Selector, ScriptedAnswer, SelectorOrder> bySelector;
};

// The entry that a class declared itself, below everything that was grafted onto it.
const Method* declaredMethod(const Class& start, Selector selector) {
  for (const Class* c = &start; c != nullptr; c = c->superclass()) {
    const Method* method = c->ownMethod(selector);
    while (method != nullptr && method->graft != nullptr) method = method->former;
    if (method != nullptr) return method;
  }
  return nullptr;
}

std::map<const Method*, MethodAnswer>& methodAnswers() {
  static auto* const answers = new std::map<const Method*, MethodAnswer>;
  return *answers;
}

void makeScripted(Method& method) {
  if (method.unscripted != nullptr) return;
  method.unscripted = method.function;
  method.function = method.signature->scripted;
  method.result = nullptr;
}

}  // namespace

void setMethodAnswer(const Method& declared, MethodAnswer answer) {
  makeScripted(const_cast<Method&>(declared));
  methodAnswers()[&declared] = std::move(answer);
}

bool setScriptedAnswer(Object& object, Selector selector, ScriptedAnswer answer) {
  auto* method = const_cast<Method*>(declaredMethod(object.isa(), selector));
  if (method == nullptr) return false;
  makeScripted(*method);
  Object* answers = object.attached(&answersKey);
  if (answers == nullptr) {
    object.attach(&answersKey, make<Answers>());
    answers = object.attached(&answersKey);
  }
  static_cast<Answers*>(answers)->bySelector[selector] = std::move(answer);
  return true;
}

void removeScriptedAnswers(Object& object) {
  object.attach(&answersKey, nullptr);
}

std::pair<bool, Ref<Object>> scriptedAnswer(Object& receiver, const Method& method,
                                            std::span<const Ref<Object>> arguments) {
  if (const auto shared = methodAnswers().find(&method); shared != methodAnswers().end()) {
    auto answer = shared->second(receiver, arguments);
    if (answer.first) return answer;
  }
  const auto* answers = static_cast<const Answers*>(receiver.attached(&answersKey));
  if (answers == nullptr) return {false, nullptr};
  const auto found = answers->bySelector.find(method.selector);
  if (found == answers->bySelector.end()) return {false, nullptr};
  return {true, found->second(arguments)};
}

GenericFunction unscriptedFunction(const Method& method) {
  return method.unscripted;
}

}  // namespace ax
