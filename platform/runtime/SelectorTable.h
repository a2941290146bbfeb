#pragma once

#include <atomic>
#include <vector>

#include "platform/runtime/PointerSlots.h"
#include "platform/runtime/Precondition.h"
#include "platform/runtime/Selector.h"

namespace ax {

// A small open-addressed table from selectors to records that name themselves by a `selector` member. It
// does not own the records. Any thread may find while one thread at a time inserts: a slot is one pointer,
// and slots that the table outgrew are kept until it ends.
template <class Record>
class SelectorTable {
 public:
  const Record* find(Selector selector) const {
    const Slots* slots = slots_.load(std::memory_order_acquire);
    if (slots == nullptr) return nullptr;
    for (std::size_t i = selector.hash() & slots->mask;; i = (i + 1) & slots->mask) {
      const Record* record = slots->at(i).load(std::memory_order_acquire);
      if (record == nullptr || record->selector == selector) return record;
    }
  }

  // Adds the record, or puts it in the place of the one with its selector.
  void insert(const Record* record) {
    precondition(bool(record->selector), "a record stands under a name: intern it first");
    if (generations_.empty() || (count_ + 1) * 2 > generations_.back()->mask + 1) grow();
    Slots& slots = *generations_.back();
    std::atomic<const Record*>& slot = slotFor(slots, record->selector);
    if (slot.load(std::memory_order_relaxed) == nullptr) ++count_;
    slot.store(record, std::memory_order_release);
  }

  void clear() {
    slots_.store(nullptr, std::memory_order_release);
    retired_.insert(retired_.end(), std::make_move_iterator(generations_.begin()),
                    std::make_move_iterator(generations_.end()));
    generations_.clear();
    count_ = 0;
  }

  void erase(Selector selector) {
    std::vector<const Record*> kept;
    forEach([&](const Record& record) {
      if (record.selector != selector) kept.push_back(&record);
    });
    clear();
    for (const Record* record : kept) insert(record);
  }

  template <class Visitor>
  void forEach(Visitor visit) const {
    if (generations_.empty()) return;
    const Slots& slots = *generations_.back();
    for (std::size_t i = 0; i <= slots.mask; ++i) {
      if (const Record* record = slots.at(i).load(std::memory_order_relaxed)) visit(*record);
    }
  }

  std::size_t size() const { return count_; }

 private:
  using Slots = PointerSlots<const Record>;

  static std::atomic<const Record*>& slotFor(Slots& slots, Selector selector) {
    for (std::size_t i = selector.hash() & slots.mask;; i = (i + 1) & slots.mask) {
      const Record* record = slots.at(i).load(std::memory_order_relaxed);
      if (record == nullptr || record->selector == selector) return slots.at(i);
    }
  }

  void grow() {
    const std::size_t size = generations_.empty() ? 8 : (generations_.back()->mask + 1) * 2;
    auto larger = Slots::make(size);
    forEach([&](const Record& record) {
      slotFor(*larger, record.selector).store(&record, std::memory_order_relaxed);
    });
    slots_.store(larger.get(), std::memory_order_release);
    generations_.push_back(std::move(larger));
  }

  std::atomic<const Slots*> slots_ = nullptr;
  std::vector<typename Slots::Owner> generations_;  // the last one is in use
  std::vector<typename Slots::Owner> retired_;
  std::size_t count_ = 0;
};

}  // namespace ax
