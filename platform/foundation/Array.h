#pragma once

#include <initializer_list>
#include <span>
#include <vector>

#include "platform/runtime/Object.h"

namespace ax {

// An ordered list of objects. It holds no nil: what it is made of loses its nil items.
class Array : public Object {
 public:
  using Items = std::vector<Ref<Object>>;
  static Class& staticClass();

  Array() = default;
  explicit Array(Items items) : items_(std::move(items)) { std::erase(items_, nullptr); }

  const Items& items() const { return items_; }
  std::size_t count() const { return items_.size(); }
  bool isEmpty() const { return items_.empty(); }
  // Nil when the index lies outside the list.
  Ref<Object> at(std::size_t index) const { return index < items_.size() ? items_[index] : nullptr; }
  Ref<Object> firstObject() const { return at(0); }
  Items::const_iterator begin() const { return items_.begin(); }
  Items::const_iterator end() const { return items_.end(); }

  bool isEqual(const Object& other) const override;
  std::string description() const override;

 protected:
  Items items_;
};

// A list that grows. Its copy is a plain Array of what it holds then.
class MutableArray final : public Array {
 public:
  static Class& staticClass();

  using Array::Array;
  // Nil is left out.
  void axSafelyAddObject(Ref<Object> object) {
    if (object) items_.push_back(std::move(object));
  }
  void reserve(std::size_t capacity) { items_.reserve(capacity); }
  Ref<Object> copy() override;
};

inline Ref<Array> array(Array::Items items) {
  return make<Array>(std::move(items));
}

// A new list of the given elements that are not nil, in order.
Ref<Array> axArrayByIgnoringNilElementsWithCount(std::size_t count,
                                                 std::initializer_list<Ref<Object>> elements);

template <class Test>
Ref<Array> ax_filteredArrayUsingBlock(const Array& all, Test test) {
  Array::Items kept;
  for (const Ref<Object>& item : all) {
    if (test(*item)) kept.push_back(item);
  }
  return array(std::move(kept));
}

}  // namespace ax
