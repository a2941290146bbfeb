#pragma once

#include <map>
#include <unordered_set>

#include "platform/runtime/Weak.h"
#include "reader/scene/ObjectTable.h"
#include "reader/scene/ValueMaker.h"

namespace ax::reader {

// Makes the objects of a scene. An object is allocated before any is filled, so that references reach objects
// that stand later in the file; it is then filled with its subviews and sublayers, its scripted answers and
// its members, in this order. What does not fit is thrown as a Fault. The scene must outlive the builder.
class ObjectBuilder {
 public:
  explicit ObjectBuilder(const std::string& file);
  // Lets go of what the objects of the scene hold of one another, so that they end with the table.
  ~ObjectBuilder();

  // Allocates an object and all that stand below it.
  void allocate(const SceneObject& object);
  // Fills an object that was allocated, or allocates it first.
  Ref<Object> build(const SceneObject& object);
  Ref<Object> value(const SceneValue& given);
  std::vector<Ref<Object>> values(const std::vector<SceneValue>& given);
  // Gives a member its value. Throws a Fault for one that it does not take; what the host raises passes
  // through.
  void setMember(const SceneMember& member, Object& made);
  // Whether the scene itself gave the object a frame.
  bool isPlaced(const Object& object) const { return placed_.contains(&object); }

  ObjectTable& table() { return table_; }
  const ObjectTable& table() const { return table_; }

 private:
  void allocateIn(const SceneValue& value);
  void addChildren(const SceneObject& object, const Ref<Object>& made);
  void fillMember(const SceneMember& member, Object& made);
  void addAnswer(const SceneAnswer& answer, Object& made);

  ObjectTable table_;
  ValueMaker maker_;
  std::map<const SceneObject*, Ref<Object>> allocated_;
  std::unordered_set<const Object*> placed_;
  std::vector<std::pair<Weak<Object>, std::string>> linked_;  // members that hold objects
};

}  // namespace ax::reader
