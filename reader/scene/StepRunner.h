#pragma once

#include <nlohmann/json.hpp>

#include "platform/accessibility/BundleLoader.h"
#include "reader/scene/ObjectBuilder.h"
#include "reader/scene/SceneStep.h"

namespace ax::reader {

// Carries out one step after the other and writes down the replies. What the host or the bundle raises is
// the step's reply. A step that cannot be carried out throws a Fault.
class StepRunner {
 public:
  // Without a bundle, calls of its functions are faults.
  StepRunner(ObjectBuilder& builder, const LoadedBundle* bundle) : builder_(builder), bundle_(bundle) {}

  // {"step": name or number, "ask": ..., "reply": ...}; null for a step that has nothing to tell.
  nlohmann::ordered_json run(const SceneStep& step, std::size_t number);
  // The reply's JSON, as steps write it.
  nlohmann::ordered_json asJson(const Ref<Object>& reply) const;

 private:
  Ref<Object> perform(const SceneStep& step, const AskStep& ask);
  Ref<Object> perform(const SceneStep& step, const ReadStep& read);
  Ref<Object> perform(const SceneStep& step, const SetStep& set);
  Ref<Object> perform(const SceneStep& step, const SceneEnvironment& change);
  Ref<Object> perform(const SceneStep& step, const CallStep& call);
  Ref<Object> perform(const SceneStep& step, const SameStep& same);
  Ref<Object> find(const SceneTarget& target) const;
  [[noreturn]] void fail(const std::string& place, const std::string& what,
                         const std::string& expected) const;

  ObjectBuilder& builder_;
  const LoadedBundle* bundle_;
};

}  // namespace ax::reader
