#pragma once

#include <nlohmann/json.hpp>
#include <optional>

#include "reader/scene/SceneEnvironment.h"
#include "reader/scene/SceneIds.h"
#include "reader/scene/SceneValue.h"

namespace ax::reader {

struct AskStep {
  std::string selector;
  SceneTarget of;
  std::vector<SceneValue> with = {};
  bool isSend = false;  // written as "send"
};
struct ReadStep {
  std::string key;
  SceneTarget of;
};
struct SetStep {
  std::vector<SceneMember> members;
  SceneTarget on;
};
struct CallStep {
  std::string function;
  std::vector<SceneValue> with = {};
};
struct SameStep {
  SceneTarget first, second;
};

struct SceneStep {
  std::string place;
  std::string name = {};  // "as"; empty: none
  std::variant<AskStep, ReadStep, SetStep, SceneEnvironment, CallStep, SameStep> action;
  std::optional<nlohmann::ordered_json> expect = {};  // the reply, as it prints
};

}  // namespace ax::reader
