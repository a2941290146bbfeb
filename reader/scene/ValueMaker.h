#pragma once

#include <functional>

#include "reader/scene/ObjectTable.h"
#include "reader/scene/SceneValue.h"

namespace ax::reader {

// Makes the values of a scene. What only shows now, it throws as a Fault.
class ValueMaker {
 public:
  using MakeObject = std::function<Ref<Object>(const SceneObject&)>;

  ValueMaker(const ObjectTable& objects, MakeObject makeObject)
      : objects_(objects), makeObject_(std::move(makeObject)) {}

  // Nil for null.
  Ref<Object> value(const SceneValue& given) const;
  std::vector<Ref<Object>> values(const std::vector<SceneValue>& given) const;

 private:
  class Visitor;

  const ObjectTable& objects_;
  MakeObject makeObject_;
};

}  // namespace ax::reader
