#pragma once

#include <unordered_set>

#include "platform/foundation/Array.h"
#include "reader/snapshot/HostQuestions.h"
#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// Walks a screen in reading order and writes down what it meets. Every object is met once, so that lists
// that lead back to themselves end; objects that are made anew at every question end with the depth and the
// count.
class SnapshotWalk {
 public:
  explicit SnapshotWalk(const ObjectNames& names) : names_(names) {}

  Snapshot take(Object& screen);

 private:
  struct Place {
    std::size_t parent;  // an index into the nodes, or none
    std::size_t depth;
  };

  void visitScreen(Object& screen);
  void visitNavigationItem(Object& controller, Place place);
  void visitEach(const Ref<Array>& objects, Place place);
  void visit(Object& object, Place place);
  void visitContainer(Object& object, Place place);
  void visitChildren(Object& object, Place place);
  void visitInvisible(Object& object, Place place);

  Ref<Object> frontMostModal(Object& view, std::size_t depth);
  bool isVisible(Object& object);
  Ref<Array> childrenInReadingOrder(Object& object);
  void addTitle(const Ref<Object>& item, const Ref<String>& title, Place place);
  void add(Node node, Object& object, Place place);
  void dropLastNode();
  void giveIds();

  const ObjectNames& names_;
  Snapshot snapshot_;
  HostQuestions questions_;
  std::unordered_set<const Object*> met_;
  Array::Items kept_;  // so that no address is met again in another object
};

}  // namespace ax::reader
