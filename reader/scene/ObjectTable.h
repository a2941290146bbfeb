#pragma once

#include <map>
#include <string>
#include <vector>

#include "platform/runtime/Object.h"
#include "reader/text/Fault.h"

namespace ax::reader {

// The objects of a run by their names, ids and results alike. It keeps every object that the scene made, so
// that members which hold theirs weakly find them.
class ObjectTable {
 public:
  explicit ObjectTable(std::string file) : file_(std::move(file)) {}
  const std::string& file() const { return file_; }

  void keep(Ref<Object> made) { made_.push_back(std::move(made)); }
  void addId(const std::string& id, const Ref<Object>& object);
  void addResult(const std::string& name, Ref<Object> result) { byName_[name] = std::move(result); }

  // The object under that id alone; nil for an unknown one.
  Ref<Object> withId(const std::string& id) const;
  const std::string& idOf(const Object& object) const;
  // What a target or a reference names: an object, a class, or an item of a list, which may be nil. Items of
  // nil are nil. Throws a Fault with this place for an item that is not there.
  Ref<Object> find(const std::string& target, const std::string& place) const;

 private:
  Ref<Object> item(const Ref<Object>& list, std::size_t index, const std::string& target,
                   const std::string& place) const;

  std::string file_;
  std::vector<Ref<Object>> made_;
  std::map<std::string, Ref<Object>> byName_;
  std::map<const Object*, std::string> ids_;
};

}  // namespace ax::reader
