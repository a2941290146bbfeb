#include "reader/scene/StepRunner.h"

#include "platform/runtime/Number.h"
#include "platform/runtime/Signature.h"
#include "reader/scene/ExportedFunctions.h"
#include "reader/scene/HostNames.h"
#include "reader/scene/MemberWriter.h"
#include "reader/scene/Raised.h"
#include "reader/scene/Reply.h"
#include "reader/scene/ValueKind.h"

namespace ax::reader {

namespace {

using Json = nlohmann::ordered_json;

// How a step names itself in its result.
struct Heading {
  std::pair<const char*, Json> operator()(const AskStep& ask) const {
    return {ask.isSend ? "send" : "ask", ask.selector};
  }
  std::pair<const char*, Json> operator()(const ReadStep& read) const { return {"read", read.key}; }
  std::pair<const char*, Json> operator()(const SetStep& set) const {
    Json keys = Json::array();
    for (const SceneMember& member : set.members) keys.push_back(member.key);
    return {"set", keys};
  }
  std::pair<const char*, Json> operator()(const SceneEnvironment&) const { return {"environment", true}; }
  std::pair<const char*, Json> operator()(const CallStep& call) const { return {"call", call.function}; }
  std::pair<const char*, Json> operator()(const SameStep& same) const {
    return {"same", {same.first.text, same.second.text}};
  }
};

bool hasReply(const SceneStep& step) {
  return !std::holds_alternative<SetStep>(step.action) &&
         !std::holds_alternative<SceneEnvironment>(step.action);
}

std::string describe(const Ref<Object>& object) {
  return cast<Class>(object.get()) != nullptr ? "the class " + object->isa().name()
                                              : "an object of class " + object->isa().name();
}

}  // namespace

Json StepRunner::run(const SceneStep& step, std::size_t number) {
  Ref<Object> reply;
  Json written;
  const auto raised = raisedBy([&] {
    reply = std::visit([&](const auto& action) { return perform(step, action); }, step.action);
    written = asJson(reply);
  });
  if (!step.name.empty()) builder_.table().addResult(step.name, reply);
  if (!raised && !hasReply(step)) return nullptr;
  Json result = Json::object();
  result["step"] = step.name.empty() ? Json(number) : Json(step.name);
  const auto [key, content] = std::visit(Heading(), step.action);
  result[key] = content;
  result["reply"] = raised ? Json{{"raised", *raised}} : written;
  return result;
}

Json StepRunner::asJson(const Ref<Object>& reply) const {
  return replyAsJson(reply, [this](const Object& object) { return builder_.table().idOf(object); });
}

void StepRunner::fail(const std::string& place, const std::string& what, const std::string& expected) const {
  throw Fault{builder_.table().file(), place, what, expected};
}

Ref<Object> StepRunner::find(const SceneTarget& target) const {
  return builder_.table().find(target.text, target.place);
}

Ref<Object> StepRunner::perform(const SceneStep& step, const AskStep& ask) {
  const Ref<Object> receiver = find(ask.of);
  const std::vector<Ref<Object>> arguments = builder_.values(ask.with);
  if (!receiver) return nullptr;
  if (!mayAnswer(*receiver, ask.selector)) {
    fail(step.place, "unknown method \"" + ask.selector + "\"", "a method of " + describe(receiver));
  }
  const Method& method = receiver->isa().lookUp(Selector::find(ask.selector));
  if (method.function == nullptr) return nullptr;  // taken away
  const auto& codes = method.signature->encodings;
  if (arguments.size() + 1 != codes.size()) {
    fail(step.place, std::to_string(arguments.size()) + " values for " + ask.selector,
         std::to_string(codes.size() - 1) + " under \"with\"");
  }
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    if (!fits(arguments[i], codes[i + 1])) {
      fail(ask.with[i].place, "a value of another kind", kindInWords(codes[i + 1]));
    }
  }
  if (method.takes != nullptr && !method.takes(arguments)) {
    fail(step.place + "/with", "an object of another class", "the classes that " + ask.selector + " takes");
  }
  return method.signature->invoke(*receiver, method, arguments);
}

Ref<Object> StepRunner::perform(const SceneStep&, const ReadStep& read) {
  const Ref<Object> receiver = find(read.of);
  return receiver ? receiver->safeValueForKey(read.key) : nullptr;
}

Ref<Object> StepRunner::perform(const SceneStep&, const SetStep& set) {
  const Ref<Object> receiver = find(set.on);
  if (!receiver) return nullptr;
  for (const SceneMember& member : set.members) builder_.setMember(member, *receiver);
  return nullptr;
}

Ref<Object> StepRunner::perform(const SceneStep&, const SceneEnvironment& change) {
  change.apply(environment());
  return nullptr;
}

Ref<Object> StepRunner::perform(const SceneStep& step, const CallStep& call) {
  const ExportedFunction& function = *exportedFunction(call.function);
  void* symbol = bundle_ == nullptr ? nullptr : bundle_->symbol(call.function);
  if (symbol == nullptr) fail(step.place, "no function " + call.function, "a bundle that exports it");
  const std::vector<Ref<Object>> arguments = builder_.values(call.with);
  for (std::size_t i = 0; i < arguments.size(); ++i) {
    if (!fits(arguments[i], function.encodings[i + 1])) {
      fail(call.with[i].place, "a value of another kind", kindInWords(function.encodings[i + 1]));
    }
  }
  if (!function.takes(arguments)) {
    fail(step.place + "/with", "an object of another class", "the classes that " + call.function + " takes");
  }
  return function.call(symbol, arguments);
}

Ref<Object> StepRunner::perform(const SceneStep&, const SameStep& same) {
  return number(find(same.first) == find(same.second));
}

}  // namespace ax::reader
