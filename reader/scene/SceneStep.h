#pragma once

#include "reader/scene/SceneEnvironment.h"
#include "reader/scene/SceneValue.h"

namespace ax::reader {

// Who a step is for: an id, an earlier result, a class, or an item of one of these ("bars.0").
struct SceneTarget {
  std::string place;
  std::string text;
};

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
};

}  // namespace ax::reader
