#pragma once

#include <atomic>
#include <cstddef>
#include <memory>
#include <new>

namespace ax {

// The slots of an open-addressed table, a power of two of them, in one block with their mask.
template <class Record>
class PointerSlots {
 public:
  using Slot = std::atomic<Record*>;
  static_assert(Slot::is_always_lock_free, "finding a name takes no lock");
  static_assert(sizeof(Slot) == sizeof(Record*) && alignof(Slot) <= alignof(std::size_t),
                "the slots stand right behind their mask");
  struct Delete {
    void operator()(PointerSlots* slots) const { ::operator delete(slots); }
  };
  using Owner = std::unique_ptr<PointerSlots, Delete>;

  static Owner make(std::size_t size) {
    auto* slots = new (::operator new(sizeof(PointerSlots) + size * sizeof(Slot))) PointerSlots(size - 1);
    for (std::size_t i = 0; i < size; ++i) new (&slots->at(i)) Slot(nullptr);
    return Owner(slots);
  }

  const std::size_t mask;

  Slot& at(std::size_t i) { return reinterpret_cast<Slot*>(this + 1)[i]; }
  const Slot& at(std::size_t i) const { return reinterpret_cast<const Slot*>(this + 1)[i]; }

 private:
  explicit PointerSlots(std::size_t lastIndex) : mask(lastIndex) {}
};

}  // namespace ax
